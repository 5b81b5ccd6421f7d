# libbrindle.so exports the C interface and nothing else: the linker hides what is not in its list, our
# own symbols as those that templates of the standard and the JSON library bring.
add_library(brindle_c SHARED $<TARGET_OBJECTS:brindle_c_objects>)
add_library(brindle::c ALIAS brindle_c)
target_link_libraries(brindle_c PRIVATE $<BUILD_INTERFACE:brindle>)
target_include_directories(brindle_c INTERFACE
    $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}>
    $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}>)
set_target_properties(brindle_c PROPERTIES
    OUTPUT_NAME brindle
    EXPORT_NAME c
    LINKER_LANGUAGE CXX
    VERSION ${PROJECT_VERSION}
    SOVERSION ${PROJECT_VERSION_MAJOR}.${PROJECT_VERSION_MINOR})
if(APPLE)
    target_link_options(brindle_c PRIVATE "LINKER:-exported_symbol,_brindle_*")
else()
    target_link_options(brindle_c PRIVATE
        "LINKER:--version-script=${PROJECT_SOURCE_DIR}/cmake/exports.map")
    set_property(TARGET brindle_c PROPERTY LINK_DEPENDS ${PROJECT_SOURCE_DIR}/cmake/exports.map)
endif()
brindle_harden(brindle_c)
