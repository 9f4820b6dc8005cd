# favrin_shader_library(<target> FOLDER <folder> <shader>...)
#
# Compiles GLSL shaders to SPIR-V and ships them as Qt resources of the target: :/<folder>/<name>.spv, where <name> is
# the shader's file name without its stage, and the name of its entry point.
function(favrin_shader_library target)
    cmake_parse_arguments(arg "" "FOLDER" "" ${ARGN})
    set(modules "")
    foreach(shader IN LISTS arg_UNPARSED_ARGUMENTS)
        get_filename_component(name "${shader}" NAME_WE)
        set(module "${CMAKE_CURRENT_BINARY_DIR}/shaders/${name}.spv")
        add_custom_command(
            OUTPUT "${module}"
            COMMAND "${Vulkan_GLSLANG_VALIDATOR_EXECUTABLE}" -V --target-env vulkan1.1 --quiet
                    --source-entrypoint main -e ${name} -o "${module}" "${shader}"
            DEPENDS "${shader}"
            VERBATIM
        )
        list(APPEND modules "${module}")
    endforeach()
    file(MAKE_DIRECTORY "${CMAKE_CURRENT_BINARY_DIR}/shaders")
    qt_add_resources(${target} "${target}_shaders" PREFIX "/${arg_FOLDER}" BASE "${CMAKE_CURRENT_BINARY_DIR}/shaders"
        FILES ${modules})
endfunction()
