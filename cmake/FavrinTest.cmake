# favrin_add_test(<name> LABELS <folder>... SOURCES <file>... LIBRARIES <target>...)
#
# One Qt Test executable and one ctest entry. The label names the folder under test ("road" for whole-road tests), so
# that one area can be run alone: ctest --preset dev -L model.
function(favrin_add_test name)
    cmake_parse_arguments(arg "" "" "LABELS;SOURCES;LIBRARIES" ${ARGN})
    add_executable(${name} ${arg_SOURCES})
    target_link_libraries(${name} PRIVATE favrin_build_options Qt6::Test ${arg_LIBRARIES})
    add_test(NAME ${name} COMMAND ${name})
    set_tests_properties(${name} PROPERTIES
        LABELS "${arg_LABELS}"
        ENVIRONMENT "QT_QPA_PLATFORM=offscreen;QT_QUICK_BACKEND=software;LC_ALL=C.UTF-8"
    )
endfunction()
