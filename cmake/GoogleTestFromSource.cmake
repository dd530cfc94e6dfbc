# GoogleTest is compiled with the flags of the preset (-m32, sanitizers), so the distribution's source
# package is taken, not its library.
set(RAID_GOOGLETEST_SOURCE "/usr/src/googletest" CACHE PATH "Source tree of GoogleTest (package googletest)")
if(NOT EXISTS "${RAID_GOOGLETEST_SOURCE}/CMakeLists.txt")
    message(FATAL_ERROR "GoogleTest's sources are not in ${RAID_GOOGLETEST_SOURCE}; install the package "
        "googletest or configure with -DRAID_BUILD_TESTS=OFF.")
endif()

set(INSTALL_GTEST OFF CACHE INTERNAL "")
set(BUILD_GMOCK ON CACHE INTERNAL "")
add_subdirectory("${RAID_GOOGLETEST_SOURCE}" "${PROJECT_BINARY_DIR}/googletest" EXCLUDE_FROM_ALL SYSTEM)
foreach(target IN ITEMS gtest gmock)
    target_compile_options(${target} PRIVATE -w -O0)
endforeach()
include(GoogleTest)
