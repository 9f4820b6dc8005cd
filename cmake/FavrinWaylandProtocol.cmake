# favrin_wayland_protocol(<target> CLIENT|SERVER <xml>...)
#
# A static library with the code that wayland-scanner makes of protocol descriptions: <name>-client-protocol.h or
# <name>-server-protocol.h, found by users of the target, and the interface tables. Generated files stay in the build.
function(favrin_wayland_protocol target side)
    string(TOLOWER "${side}" side)
    set(generated "")
    foreach(xml IN LISTS ARGN)
        get_filename_component(name "${xml}" NAME_WE)
        set(header "${CMAKE_CURRENT_BINARY_DIR}/${name}-${side}-protocol.h")
        set(code "${CMAKE_CURRENT_BINARY_DIR}/${name}-${side}-protocol.c")
        add_custom_command(
            OUTPUT "${header}" "${code}"
            COMMAND "${FAVRIN_WAYLAND_SCANNER}" --strict ${side}-header "${xml}" "${header}"
            COMMAND "${FAVRIN_WAYLAND_SCANNER}" --strict private-code "${xml}" "${code}"
            DEPENDS "${xml}"
            VERBATIM
        )
        list(APPEND generated "${header}" "${code}")
    endforeach()
    add_library(${target} STATIC ${generated})
    set_target_properties(${target} PROPERTIES AUTOMOC OFF)
    target_include_directories(${target} SYSTEM PUBLIC "${CMAKE_CURRENT_BINARY_DIR}")
    if(side STREQUAL "client")
        target_link_libraries(${target} PUBLIC PkgConfig::WaylandClient)
    else()
        target_link_libraries(${target} PUBLIC PkgConfig::WaylandServer)
    endif()
endfunction()
