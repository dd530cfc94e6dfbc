# raid_add_test(NAME <name> SOURCES <files> [LIBRARIES <targets>] [DEFINITIONS <macros>] [COST <number>])
#
# Those that cost more begin sooner.
#
# One test executable below <build>/tests/bin; each of its tests is a test of CTest, run in a process
# (and so in a network namespace and a working directory) of its own.
function(raid_add_test)
    cmake_parse_arguments(PARSE_ARGV 0 arg "" "NAME;COST" "SOURCES;LIBRARIES;DEFINITIONS")
    if(NOT arg_NAME OR NOT arg_SOURCES OR arg_UNPARSED_ARGUMENTS)
        message(FATAL_ERROR "raid_add_test needs NAME and SOURCES; left over: '${arg_UNPARSED_ARGUMENTS}'")
    endif()
    add_executable(${arg_NAME} ${arg_SOURCES})
    target_link_libraries(${arg_NAME} PRIVATE raid_gtest_main raid::warnings ${arg_LIBRARIES})
    target_compile_definitions(${arg_NAME} PRIVATE ${arg_DEFINITIONS})
    target_precompile_headers(${arg_NAME} REUSE_FROM raid_gtest_main)
    set_target_properties(${arg_NAME} PROPERTIES
        RUNTIME_OUTPUT_DIRECTORY "${PROJECT_BINARY_DIR}/tests/bin")
    set(properties TIMEOUT 120)
    if(arg_COST)
        list(APPEND properties COST ${arg_COST})
    endif()
    gtest_discover_tests(${arg_NAME} DISCOVERY_MODE PRE_TEST DISCOVERY_TIMEOUT 60
        PROPERTIES ${properties})
endfunction()
