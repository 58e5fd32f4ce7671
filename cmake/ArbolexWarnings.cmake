# Project-wide compile settings applied to our own targets through arbolex_settings().
#
# -ffp-contract=off: no fused multiply-add, so a result is the same at every
# optimisation level; -ffast-math is never used.
add_library(arbolex_compile_settings INTERFACE)
target_compile_options(arbolex_compile_settings INTERFACE
    -Wall -Wextra -Wpedantic -Wshadow -Wconversion -Wno-sign-conversion
    -Wnon-virtual-dtor -Wold-style-cast -Woverloaded-virtual
    -ffp-contract=off)
if(ARBOLEX_WERROR)
    target_compile_options(arbolex_compile_settings INTERFACE -Werror)
endif()
if(ARBOLEX_SANITIZE)
    target_compile_options(arbolex_compile_settings INTERFACE
        -fsanitize=address,undefined -fno-sanitize-recover=undefined -fno-omit-frame-pointer)
    target_link_options(arbolex_compile_settings INTERFACE -fsanitize=address,undefined)
endif()
# The fuzzing build: coverage for libFuzzer and both sanitizers in every
# library, so a fault deep in a reader stops the harness.
if(ARBOLEX_FUZZ)
    target_compile_options(arbolex_compile_settings INTERFACE
        -fsanitize=fuzzer-no-link,address,undefined -fno-sanitize-recover=undefined
        -fno-omit-frame-pointer)
    target_link_options(arbolex_compile_settings INTERFACE -fsanitize=address,undefined)
endif()

# Qt string discipline for the application and the windows.
add_library(arbolex_qt_settings INTERFACE)
target_compile_definitions(arbolex_qt_settings INTERFACE
    QT_NO_CAST_FROM_ASCII QT_NO_CAST_TO_ASCII QT_NO_URL_CAST_FROM_STRING
    QT_DISABLE_DEPRECATED_BEFORE=0x060400)

function(arbolex_settings target)
    target_link_libraries(${target} PRIVATE arbolex_compile_settings)
endfunction()
