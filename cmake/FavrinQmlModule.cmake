# favrin_qml_module(<target> URI <Favrin.Name> [SOURCES ...] [QML_FILES ...] [RESOURCES ...] [MODULES <target>...])
#
# A static library whose types and QML files form one QML module, compiled ahead of time. Its files live in the
# executable under qrc:/qt/qml/Favrin/Name; the engine needs addImportPath("qrc:/qt/qml"), which Qt does by itself only
# from 6.5 on. Types are headers with QML_ELEMENT (QML_SINGLETON, ...) listed in SOURCES. A QML file that uses a C++ type
# of its own module imports the module by name: up to 6.4 a file's own folder gives it the QML files only.
#
# MODULES names the modules of ours that this one imports or whose types it uses; they are linked and come along.
# Both the linter (target all_qmllint) and the compiler of the QML files see them.
#
# An executable or test gets modules by favrin_link_qml_modules(<target> <module target>...), once for the topmost ones.
# A plain library that only uses the C++ of a module links the module's target like any other.
function(favrin_qml_module target)
    cmake_parse_arguments(arg "" "URI" "SOURCES;QML_FILES;RESOURCES;MODULES" ${ARGN})
    string(REPLACE "." "/" path "${arg_URI}")
    # A property's type must be known from the module alone: QtQuick holds color and font.
    set(dependencies QtQuick)
    foreach(module IN LISTS arg_MODULES)
        get_target_property(uri ${module} QT_QML_MODULE_URI)
        list(APPEND dependencies ${uri})
    endforeach()
    qt_add_library(${target} STATIC)
    qt_add_qml_module(${target}
        URI ${arg_URI}
        VERSION 1.0
        RESOURCE_PREFIX /qt/qml
        OUTPUT_DIRECTORY "${PROJECT_BINARY_DIR}/qml/${path}"
        IMPORT_PATH "${PROJECT_BINARY_DIR}/qml"
        SOURCES ${arg_SOURCES}
        QML_FILES ${arg_QML_FILES}
        RESOURCES ${arg_RESOURCES}
        DEPENDENCIES ${dependencies}
    )
    # Our warnings are for our own code.
    get_target_property(sources ${target} SOURCES)
    list(FILTER sources INCLUDE REGEX "/qmlcache/.*\\.cpp$|_qmltyperegistrations\\.cpp$")
    set_source_files_properties(${sources} PROPERTIES COMPILE_OPTIONS "-w")
    target_link_libraries(${target} PUBLIC favrin_build_options Qt6::Qml Qt6::Quick)
    # The generated type registration includes the headers of the types by file name alone.
    target_include_directories(${target} PRIVATE "${CMAKE_CURRENT_SOURCE_DIR}")
    favrin_link_qml_modules(${target} ${arg_MODULES})
    foreach(module IN LISTS arg_MODULES)
        # The compiler and the linter of the QML files read what the other module generates.
        add_dependencies(${target} ${module})
        if(TARGET ${target}_qmllint)
            add_dependencies(${target}_qmllint ${module})
        endif()
    endforeach()
endfunction()

# favrin_link_qml_modules(<target> <module target>...)
#
# Links the modules with their static plugins; without the plugin the linker would drop the registration of the types
# and the compiled QML.
function(favrin_link_qml_modules target)
    get_target_property(type ${target} TYPE)
    set(scope PRIVATE)
    if(type STREQUAL "STATIC_LIBRARY")
        set(scope PUBLIC)
    endif()
    foreach(module IN LISTS ARGN)
        target_link_libraries(${target} ${scope} ${module} ${module}plugin)
    endforeach()
endfunction()
