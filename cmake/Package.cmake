# Debian packages, made by cpack: `brindle` has the program with its data, translations, man pages
# and completions, `libbrindle0.1` the shared library, `libbrindle-dev` what hosts build with.
# tools/make_packages.sh makes and tries them. The address is nobody's until the project has one.
set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME brindle)
set(CPACK_PACKAGE_CONTACT "The Brindle authors <authors@brindle.invalid>")
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_STRIP_FILES ON)
set(CPACK_COMPONENTS_ALL program library dev)
set(CPACK_COMPONENTS_GROUPING IGNORE)
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
    OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_RELEASE 1)
set(CPACK_DEBIAN_PACKAGE_PRIORITY optional)

set(CPACK_DEBIAN_PROGRAM_PACKAGE_NAME brindle)
set(CPACK_DEBIAN_PROGRAM_PACKAGE_SECTION sound)
set(CPACK_DEBIAN_PROGRAM_PACKAGE_SHLIBDEPS ON)
set(CPACK_COMPONENT_PROGRAM_DESCRIPTION
"Reads the chord symbols of a song as a teacher does: its keys, the numeral and
the function of each chord, what kind of chord it is there and where it leads.
Songs are chord texts, lyrics with chords, packed charts or scores in MusicXML;
results are text, JSON, pictures and MIDI.")

# The name of the package is that of the library with the version that programs ask for.
set(library_package libbrindle${PROJECT_VERSION_MAJOR}.${PROJECT_VERSION_MINOR})
set(CPACK_DEBIAN_LIBRARY_PACKAGE_NAME ${library_package})
set(CPACK_DEBIAN_LIBRARY_PACKAGE_SECTION libs)
set(CPACK_DEBIAN_LIBRARY_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_LIBRARY_PACKAGE_RECOMMENDS brindle)
# What Debian's own tools write into packages of shared libraries.
set(library_control ${PROJECT_BINARY_DIR}/package/library)
file(WRITE ${library_control}/triggers "activate-noawait ldconfig\n")
file(WRITE ${library_control}/shlibs "libbrindle ${PROJECT_VERSION_MAJOR}.${PROJECT_VERSION_MINOR} "
    "${library_package} (>= ${PROJECT_VERSION})\n")
set(CPACK_DEBIAN_LIBRARY_PACKAGE_CONTROL_EXTRA ${library_control}/triggers ${library_control}/shlibs)
set(CPACK_COMPONENT_LIBRARY_DESCRIPTION
"The library under the program brindle, with an interface in C: songs and their
analyses, chord symbols, keys, names of notes, fingerings, models and scores.
Its data come with the program.")

# What the headers and the archive need of a host; keep in step with find_package in CMakeLists.txt.
set(CPACK_DEBIAN_DEV_PACKAGE_NAME libbrindle-dev)
set(CPACK_DEBIAN_DEV_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_DEV_PACKAGE_DEPENDS
    "${library_package} (= ${PROJECT_VERSION}-1), libboost-dev, libfmt-dev, nlohmann-json3-dev, libxml2-dev, libzip-dev, libplist-dev")
set(CPACK_DEBIAN_DEV_PACKAGE_RECOMMENDS "brindle, pkg-config")
set(CPACK_COMPONENT_DEV_DESCRIPTION
"The library under the program brindle, for programs in C and C++: headers, an
archive, and what CMake and pkg-config need to find them. Its data come with
the program.")

find_program(GZIP gzip)
if(GZIP)
    foreach(name changelog changelog.Debian)
        set(source ${PROJECT_SOURCE_DIR}/cmake/package/${name})
        if(name STREQUAL changelog)
            set(source ${PROJECT_SOURCE_DIR}/CHANGELOG.md)
        endif()
        set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${source})
        file(MAKE_DIRECTORY ${PROJECT_BINARY_DIR}/package)
        execute_process(COMMAND ${GZIP} -9nc ${source}
            OUTPUT_FILE ${PROJECT_BINARY_DIR}/package/${name}.gz)
    endforeach()
endif()
foreach(component program library dev)
    string(TOUPPER ${component} upper)
    install(FILES ${PROJECT_SOURCE_DIR}/cmake/package/copyright
                  ${PROJECT_BINARY_DIR}/package/changelog.gz
                  ${PROJECT_BINARY_DIR}/package/changelog.Debian.gz
            DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/${CPACK_DEBIAN_${upper}_PACKAGE_NAME}
            COMPONENT ${component} EXCLUDE_FROM_ALL)
endforeach()
# Debian's man pages are packed.
install(CODE "
    file(GLOB pages \"\$ENV{DESTDIR}\${CMAKE_INSTALL_PREFIX}/${CMAKE_INSTALL_MANDIR}/man1/*.1\")
    if(pages)
        execute_process(COMMAND ${GZIP} -9n \${pages})
    endif()" COMPONENT program EXCLUDE_FROM_ALL)
include(CPack)
