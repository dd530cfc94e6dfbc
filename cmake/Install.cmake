# What "cmake --install" puts where: the library, its headers, and the two ways to find them. The
# programs install themselves.
include(CMakePackageConfigHelpers)

install(TARGETS RAIDInstrumentation EXPORT RAIDInstrumentationTargets
    LIBRARY DESTINATION "${CMAKE_INSTALL_LIBDIR}")

install(FILES "${PROJECT_SOURCE_DIR}/include/RAIDInstrumentation.h"
    DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}")
# The C++ headers include each other by relative paths, so they keep their folders.
set(publicHeaders
    agent/agent_link.h
    agent/envelope.h
    agent/exchange.h
    agent/saved_answers.h
    diag/debug.h
    flat/lists.h
    flat/packing.h
    flat/snapshot.h
    model/arrays.h
    model/channels_and_drives.h
    model/enclosures.h
    model/logical_drives.h
    model/raid_events.h
    model/system_and_adapter.h
    xml/parse_def_unit.h
    xml/raid_xml_error.h
    xml/blank.h)
foreach(header IN LISTS publicHeaders)
    cmake_path(GET header PARENT_PATH folder)
    install(FILES "${PROJECT_SOURCE_DIR}/src/${header}"
        DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}/RAIDInstrumentation/${folder}")
endforeach()

set(packageDir "${CMAKE_INSTALL_LIBDIR}/cmake/RAIDInstrumentation")
if(CMAKE_INSTALL_LIBDIR STREQUAL "lib32")
    # Debian's CMake does not look into lib32. Every folder that begins with the package's name is
    # tried, and the version file turns callers of the other width away.
    set(packageDir "lib/cmake/RAIDInstrumentation-i386")
endif()
install(EXPORT RAIDInstrumentationTargets
    NAMESPACE RAIDInstrumentation:: DESTINATION "${packageDir}")
configure_package_config_file(
    "${PROJECT_SOURCE_DIR}/cmake/RAIDInstrumentationConfig.cmake.in" RAIDInstrumentationConfig.cmake
    INSTALL_DESTINATION "${packageDir}")
write_basic_package_version_file(RAIDInstrumentationConfigVersion.cmake
    COMPATIBILITY SameMajorVersion)
install(FILES
    "${PROJECT_BINARY_DIR}/RAIDInstrumentationConfig.cmake"
    "${PROJECT_BINARY_DIR}/RAIDInstrumentationConfigVersion.cmake"
    DESTINATION "${packageDir}")

# Relative to the file's own folder, so that the installed tree can be moved.
file(RELATIVE_PATH RAID_PREFIX_FROM_PKGCONFIG
    "${CMAKE_INSTALL_FULL_LIBDIR}/pkgconfig" "${CMAKE_INSTALL_PREFIX}")
configure_file("${PROJECT_SOURCE_DIR}/cmake/RAIDInstrumentation.pc.in" RAIDInstrumentation.pc @ONLY)
install(FILES "${PROJECT_BINARY_DIR}/RAIDInstrumentation.pc"
    DESTINATION "${CMAKE_INSTALL_LIBDIR}/pkgconfig")
