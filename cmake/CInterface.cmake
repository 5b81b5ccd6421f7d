# The objects of the C interface, of which the shared library and the WebAssembly module are made.
target_compile_features(brindle_c_objects PRIVATE cxx_std_20)
target_include_directories(brindle_c_objects PRIVATE ${PROJECT_SOURCE_DIR})
target_link_libraries(brindle_c_objects PRIVATE
    Boost::headers nlohmann_json::nlohmann_json fmt::fmt brindle_warnings)
target_compile_options(brindle_c_objects PRIVATE -ffp-contract=off)
set_target_properties(brindle_c_objects PROPERTIES
    CXX_VISIBILITY_PRESET hidden
    VISIBILITY_INLINES_HIDDEN ON
    POSITION_INDEPENDENT_CODE ${brindle_is_shared})
brindle_harden(brindle_c_objects)
