# The installed package: headers under include/brindle, the archive, the shared library of the C
# interface, a CMake package `Brindle` with the targets brindle::brindle (C++) and brindle::c, and
# the pkg-config files `brindle` and `brindle-c`.
include(CMakePackageConfigHelpers)

set(package_dir ${CMAKE_INSTALL_LIBDIR}/cmake/Brindle)

install(TARGETS brindle EXPORT BrindleTargets)
install(TARGETS brindle_c EXPORT BrindleCTargets
        LIBRARY COMPONENT library NAMELINK_COMPONENT dev)
install(DIRECTORY ${PROJECT_SOURCE_DIR}/brindle DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}
        FILES_MATCHING PATTERN "*.h" PATTERN internal EXCLUDE)
install(EXPORT BrindleTargets NAMESPACE brindle:: DESTINATION ${package_dir})
install(EXPORT BrindleCTargets NAMESPACE brindle:: DESTINATION ${package_dir})

configure_package_config_file(${CMAKE_CURRENT_LIST_DIR}/BrindleConfig.cmake.in
    ${PROJECT_BINARY_DIR}/BrindleConfig.cmake INSTALL_DESTINATION ${package_dir})
write_basic_package_version_file(${PROJECT_BINARY_DIR}/BrindleConfigVersion.cmake
    COMPATIBILITY SameMinorVersion)
install(FILES ${PROJECT_BINARY_DIR}/BrindleConfig.cmake
              ${PROJECT_BINARY_DIR}/BrindleConfigVersion.cmake
        DESTINATION ${package_dir})

# The data that the library finds by ResourceFolder().
install(DIRECTORY "${PROJECT_SOURCE_DIR}/data/Chord Grids" DESTINATION ${CMAKE_INSTALL_DATADIR}/brindle
        COMPONENT program)

# The archive leaves its own libraries to the host's link line, the shared library brings them.
string(JOIN ", " pc_requires ${brindle_pc_libraries})
cmake_path(IS_ABSOLUTE CMAKE_INSTALL_INCLUDEDIR includedir_is_absolute)
cmake_path(IS_ABSOLUTE CMAKE_INSTALL_LIBDIR libdir_is_absolute)
if(includedir_is_absolute OR libdir_is_absolute)
    set(pc_prefix ${CMAKE_INSTALL_PREFIX})
    set(pc_includedir ${CMAKE_INSTALL_FULL_INCLUDEDIR})
    set(pc_libdir ${CMAKE_INSTALL_FULL_LIBDIR})
else()
    # Relative to the file itself, so that the installed folder can be moved.
    file(RELATIVE_PATH up /prefix/${CMAKE_INSTALL_LIBDIR}/pkgconfig /prefix)
    string(REGEX REPLACE "/$" "" up ${up})
    set(pc_prefix "\${pcfiledir}/${up}")
    set(pc_includedir "\${prefix}/${CMAKE_INSTALL_INCLUDEDIR}")
    set(pc_libdir "\${prefix}/${CMAKE_INSTALL_LIBDIR}")
endif()
foreach(name brindle brindle-c)
    configure_file(${CMAKE_CURRENT_LIST_DIR}/${name}.pc.in ${PROJECT_BINARY_DIR}/${name}.pc @ONLY)
    install(FILES ${PROJECT_BINARY_DIR}/${name}.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
endforeach()
