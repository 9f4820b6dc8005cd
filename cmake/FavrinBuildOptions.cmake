# Warnings, sanitizers and floating-point rules come from one interface target that every target of ours links.
add_library(favrin_build_options INTERFACE)

target_compile_options(favrin_build_options INTERFACE
    -Wall -Wextra -Wpedantic -Wshadow -Wnon-virtual-dtor -Woverloaded-virtual -Wcast-align -Wunused
    # A fused multiply-add changes the last bit of color arithmetic.
    -ffp-contract=off
)
if(FAVRIN_WARNINGS_AS_ERRORS)
    target_compile_options(favrin_build_options INTERFACE -Werror)
endif()
target_compile_definitions(favrin_build_options INTERFACE
    QT_NO_CAST_FROM_ASCII QT_NO_CAST_TO_ASCII QT_NO_URL_CAST_FROM_STRING QT_NO_KEYWORDS QT_NO_FOREACH
    QT_STRICT_ITERATORS
)
if(FAVRIN_SANITIZERS)
    target_compile_options(favrin_build_options INTERFACE
        -fsanitize=${FAVRIN_SANITIZERS} -fno-omit-frame-pointer -fno-sanitize-recover=all)
    target_link_options(favrin_build_options INTERFACE -fsanitize=${FAVRIN_SANITIZERS})
endif()
if(FAVRIN_BUILD_FUZZERS)
    # Everything tells the fuzzer which way an input took.
    target_compile_options(favrin_build_options INTERFACE -fsanitize=fuzzer-no-link)
endif()

# Include paths start at src/, so that an include names the folder it comes from.
target_include_directories(favrin_build_options INTERFACE "${PROJECT_SOURCE_DIR}/src")
