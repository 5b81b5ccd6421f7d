# For WebAssembly: headers of the system's packages that are plain C++, without the headers of its C
# library beside them, and libxml2 as cmake/web.sh has built it, in BRINDLE_WEB_LIBRARIES.
set(BRINDLE_WEB_LIBRARIES "" CACHE PATH "Where libxml2 was installed for WebAssembly")

foreach(library boost:version.hpp fmt:format.h nlohmann:json.hpp)
    string(REGEX MATCH "(.*):(.*)" parts ${library})
    find_path(BRINDLE_HEADERS_${CMAKE_MATCH_1} ${CMAKE_MATCH_1}/${CMAKE_MATCH_2}
        PATHS /usr/include /usr/local/include NO_DEFAULT_PATH NO_CMAKE_FIND_ROOT_PATH REQUIRED)
    set(folder ${PROJECT_BINARY_DIR}/headers/${CMAKE_MATCH_1})
    file(MAKE_DIRECTORY ${folder})
    file(CREATE_LINK ${BRINDLE_HEADERS_${CMAKE_MATCH_1}}/${CMAKE_MATCH_1} ${folder}/${CMAKE_MATCH_1}
        SYMBOLIC)
endforeach()

function(brindle_header_library name folder)
    add_library(${name} INTERFACE IMPORTED GLOBAL)
    target_include_directories(${name} SYSTEM INTERFACE ${PROJECT_BINARY_DIR}/headers/${folder})
endfunction()
brindle_header_library(Boost::headers boost)
brindle_header_library(nlohmann_json::nlohmann_json nlohmann)
brindle_header_library(fmt::fmt fmt)
target_compile_definitions(fmt::fmt INTERFACE FMT_HEADER_ONLY)

if(BRINDLE_SCORES)
    add_library(LibXml2::LibXml2 STATIC IMPORTED GLOBAL)
    set_target_properties(LibXml2::LibXml2 PROPERTIES
        IMPORTED_LOCATION ${BRINDLE_WEB_LIBRARIES}/lib/libxml2.a
        INTERFACE_INCLUDE_DIRECTORIES ${BRINDLE_WEB_LIBRARIES}/include/libxml2
        INTERFACE_COMPILE_DEFINITIONS LIBXML_STATIC)
endif()

# The exceptions of WebAssembly itself: no call goes through JavaScript for them.
add_compile_options(-fwasm-exceptions)
add_link_options(-fwasm-exceptions)
