# raid_add_python_tests(PREFIX <prefix> [ENVIRONMENT <NAME=value>...])
#
# Each *_test.py of the folder is a test of CTest, run by pytest in a process, a network namespace and a
# working directory of its own. They need Debian's interpreter, since the tools that they use are packages
# for it.
find_program(RAID_PYTHON python3 PATHS /usr/bin NO_DEFAULT_PATH REQUIRED)

function(raid_add_python_tests)
    cmake_parse_arguments(PARSE_ARGV 0 arg "" "PREFIX" "ENVIRONMENT")
    set(environment
        "PYTHONDONTWRITEBYTECODE=1"
        "RAID_SOURCES=${PROJECT_SOURCE_DIR}"
        "RAID_LIBRARY=$<TARGET_FILE:RAIDInstrumentation>"
        "RAIDINFO_PROGRAM=$<TARGET_FILE:raidinfo>"
        "RAIDSIM_PROGRAM=$<TARGET_FILE:raidsim>"
        ${arg_ENVIRONMENT})
    file(GLOB tests CONFIGURE_DEPENDS *_test.py)
    foreach(test IN LISTS tests)
        cmake_path(GET test STEM name)
        add_test(NAME ${arg_PREFIX}.${name}
            COMMAND isolated "${RAID_PYTHON}" -m pytest --quiet -W error -p no:cacheprovider
                -o faulthandler_timeout=100 "${test}")
        set_tests_properties(${arg_PREFIX}.${name} PROPERTIES
            ENVIRONMENT "${environment}" TIMEOUT 300)
    endforeach()
endfunction()
