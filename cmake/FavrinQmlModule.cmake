# favrin_qml_module(<target> URI <Favrin.Name> [SOURCES ...] [QML_FILES ...] [RESOURCES ...])
#
# A static library whose types and QML files form one QML module, compiled ahead of time. The module lives under the
# fixed prefix /qt/qml, which Qt makes the default only from 6.5 on, and needs no plugin: executables link the library
# and call its generated registration through favrin_link_qml_modules().
function(favrin_qml_module target)
    cmake_parse_arguments(arg "" "URI" "SOURCES;QML_FILES;RESOURCES" ${ARGN})
    qt_add_library(${target} STATIC)
    qt_add_qml_module(${target}
        URI ${arg_URI}
        VERSION 1.0
        RESOURCE_PREFIX /qt/qml
        OUTPUT_DIRECTORY "${PROJECT_BINARY_DIR}/qml/${arg_URI}"
        SOURCES ${arg_SOURCES}
        QML_FILES ${arg_QML_FILES}
        RESOURCES ${arg_RESOURCES}
    )
    target_link_libraries(${target} PUBLIC favrin_build_options Qt6::Qml Qt6::Quick)
    # The generated type registration includes the headers of the types by file name alone.
    target_include_directories(${target} PRIVATE "${CMAKE_CURRENT_SOURCE_DIR}")
endfunction()
