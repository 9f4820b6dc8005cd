# Where things are installed, and how installed files find each other. The tree may be moved as a whole: every path from
# one installed file to another is relative.
include(GNUInstallDirs)
include(CMakePackageConfigHelpers)

set(FAVRIN_INSTALL_QMLDIR "${CMAKE_INSTALL_LIBDIR}/qt6/qml" CACHE STRING "Where QML modules are installed")
set(FAVRIN_INSTALL_CMAKEDIR "${CMAKE_INSTALL_LIBDIR}/cmake/FavrinColorPicker")

# favrin_relative_path(<variable> FROM <folder> TO <path>): between two paths below the prefix.
function(favrin_relative_path variable)
    cmake_parse_arguments(arg "" "FROM;TO" "" ${ARGN})
    cmake_path(ABSOLUTE_PATH arg_FROM BASE_DIRECTORY "${CMAKE_INSTALL_PREFIX}" NORMALIZE)
    cmake_path(ABSOLUTE_PATH arg_TO BASE_DIRECTORY "${CMAKE_INSTALL_PREFIX}" NORMALIZE)
    cmake_path(RELATIVE_PATH arg_TO BASE_DIRECTORY "${arg_FROM}")
    set(${variable} "${arg_TO}" PARENT_SCOPE)
endfunction()

# favrin_find_library_from(<target> <folder>): installed into this folder, the target finds the host library.
function(favrin_find_library_from target folder)
    favrin_relative_path(path FROM "${folder}" TO "${CMAKE_INSTALL_LIBDIR}")
    set_target_properties(${target} PROPERTIES INSTALL_RPATH "$ORIGIN/${path}")
endfunction()

# favrin_install_package(): the CMake package and the pkg-config file for those who build on the library.
function(favrin_install_package)
    set(package "${PROJECT_BINARY_DIR}/package")
    configure_package_config_file("${PROJECT_SOURCE_DIR}/cmake/FavrinColorPickerConfig.cmake.in"
        "${package}/FavrinColorPickerConfig.cmake"
        INSTALL_DESTINATION "${FAVRIN_INSTALL_CMAKEDIR}"
        PATH_VARS FAVRIN_INSTALL_QMLDIR
    )
    write_basic_package_version_file("${package}/FavrinColorPickerConfigVersion.cmake"
        COMPATIBILITY SameMajorVersion)
    install(FILES "${package}/FavrinColorPickerConfig.cmake" "${package}/FavrinColorPickerConfigVersion.cmake"
        DESTINATION "${FAVRIN_INSTALL_CMAKEDIR}" COMPONENT development)
    install(EXPORT FavrinColorPickerTargets
        NAMESPACE FavrinColorPicker::
        DESTINATION "${FAVRIN_INSTALL_CMAKEDIR}" COMPONENT development)

    favrin_relative_path(prefix_from_pkgconfig FROM "${CMAKE_INSTALL_LIBDIR}/pkgconfig" TO "${CMAKE_INSTALL_PREFIX}")
    favrin_relative_path(libdir FROM "${CMAKE_INSTALL_PREFIX}" TO "${CMAKE_INSTALL_LIBDIR}")
    favrin_relative_path(includedir FROM "${CMAKE_INSTALL_PREFIX}" TO "${CMAKE_INSTALL_INCLUDEDIR}")
    configure_file("${PROJECT_SOURCE_DIR}/cmake/FavrinColorPicker.pc.in" "${package}/FavrinColorPicker.pc" @ONLY)
    install(FILES "${package}/FavrinColorPicker.pc" DESTINATION "${CMAKE_INSTALL_LIBDIR}/pkgconfig"
        COMPONENT development)
endfunction()
