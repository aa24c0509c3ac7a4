# SPDX-License-Identifier: Apache-2.0
# What an installation consists of: the library, its headers, and what CMake and pkg-config need to find them.

include(CMakePackageConfigHelpers)

set(package_dir "${CMAKE_INSTALL_LIBDIR}/cmake/EditorModel")
set(pkgconfig_dir "${CMAKE_INSTALL_LIBDIR}/pkgconfig")

install(TARGETS EditorModel
    EXPORT EditorModelTargets
    LIBRARY DESTINATION "${CMAKE_INSTALL_LIBDIR}"
    FILE_SET HEADERS DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}")
install(EXPORT EditorModelTargets
    NAMESPACE EditorModel::
    DESTINATION "${package_dir}")

configure_package_config_file(cmake/EditorModelConfig.cmake.in EditorModelConfig.cmake
    INSTALL_DESTINATION "${package_dir}")
# The interface may still change with every minor version.
write_basic_package_version_file(EditorModelConfigVersion.cmake COMPATIBILITY SameMinorVersion)
install(FILES
    "${CMAKE_CURRENT_BINARY_DIR}/EditorModelConfig.cmake"
    "${CMAKE_CURRENT_BINARY_DIR}/EditorModelConfigVersion.cmake"
    DESTINATION "${package_dir}")

# From where the .pc file stands up to the prefix, so that an installation can be moved.
file(RELATIVE_PATH prefix_from_pkgconfig "/prefix/${pkgconfig_dir}" "/prefix")
configure_file(cmake/EditorModel.pc.in EditorModel.pc @ONLY)
install(FILES "${CMAKE_CURRENT_BINARY_DIR}/EditorModel.pc" DESTINATION "${pkgconfig_dir}")
