# Warnings and sanitizers for our own targets only: hosts that add us as a sub-project keep theirs.
add_library(brindle_warnings INTERFACE)
target_compile_options(brindle_warnings INTERFACE
    -Wall -Wextra -Wpedantic -Wshadow -Wconversion -Wsign-conversion -Wnon-virtual-dtor
    # GCC 12 sees overlapping copies in plain assignments to std::string (its bug 105651).
    $<$<AND:$<CXX_COMPILER_ID:GNU>,$<VERSION_LESS:$<CXX_COMPILER_VERSION>,13>>:-Wno-restrict>
    # Optimizing, GCC 12 sees small_vector copy more than it holds when one is moved or copied.
    $<$<CXX_COMPILER_ID:GNU>:-Wno-stringop-overread>
    # With sanitizers GCC takes fields of std::regex for uninitialized (its bug 105562).
    $<$<AND:$<CXX_COMPILER_ID:GNU>,$<BOOL:${BRINDLE_SANITIZE}>>:-Wno-maybe-uninitialized>
    $<$<BOOL:${BRINDLE_WERROR}>:-Werror>)

if(BRINDLE_SANITIZE)
    add_compile_options(-fsanitize=address,undefined -fno-sanitize-recover=all -fno-omit-frame-pointer)
    add_link_options(-fsanitize=address,undefined)
endif()
if(BRINDLE_LIBFUZZER)
    add_compile_options(-fsanitize=fuzzer-no-link)
endif()
