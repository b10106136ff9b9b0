# What an installation holds: the library, its public headers, the tool, and the two ways to find the
# library (CMake package and pkg-config). Both work out the prefix from their own place, so that an
# installation may be moved as a whole.
include(CMakePackageConfigHelpers)

set(package_dir ${CMAKE_INSTALL_LIBDIR}/cmake/Vesk_Hdl)
set(pkgconfig_dir ${CMAKE_INSTALL_LIBDIR}/pkgconfig)

install(TARGETS Vesk_Hdl
    EXPORT Vesk_HdlTargets
    FILE_SET HEADERS)
if(VESK_HDL_BUILD_TOOL)
    install(TARGETS vesk-hdl)
endif()

install(EXPORT Vesk_HdlTargets
    NAMESPACE Vesk_Hdl::
    DESTINATION ${package_dir})
configure_package_config_file(
    ${PROJECT_SOURCE_DIR}/cmake/Vesk_HdlConfig.cmake.in
    ${PROJECT_BINARY_DIR}/Vesk_HdlConfig.cmake
    INSTALL_DESTINATION ${package_dir})
# As with the SOVERSION, all releases of one major version can stand for each other.
write_basic_package_version_file(
    ${PROJECT_BINARY_DIR}/Vesk_HdlConfigVersion.cmake
    COMPATIBILITY SameMajorVersion)
install(FILES
    ${PROJECT_BINARY_DIR}/Vesk_HdlConfig.cmake
    ${PROJECT_BINARY_DIR}/Vesk_HdlConfigVersion.cmake
    DESTINATION ${package_dir})

# Names for vesk_hdl.pc: from its folder up to the prefix, and from there down again. A folder given
# as an absolute path (distributions do that) stays as it is.
set(pc_prefix ${CMAKE_INSTALL_PREFIX})
if(NOT IS_ABSOLUTE ${CMAKE_INSTALL_LIBDIR})
    file(RELATIVE_PATH up ${CMAKE_INSTALL_PREFIX}/${pkgconfig_dir} ${CMAKE_INSTALL_PREFIX})
    string(REGEX REPLACE "/$" "" pc_prefix "\${pcfiledir}/${up}")
endif()
foreach(kind IN ITEMS LIB INCLUDE)
    set(pc_${kind}DIR ${CMAKE_INSTALL_${kind}DIR})
    if(NOT IS_ABSOLUTE ${CMAKE_INSTALL_${kind}DIR})
        set(pc_${kind}DIR "\${prefix}/${CMAKE_INSTALL_${kind}DIR}")
    endif()
endforeach()
configure_file(${PROJECT_SOURCE_DIR}/cmake/vesk_hdl.pc.in ${PROJECT_BINARY_DIR}/vesk_hdl.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/vesk_hdl.pc DESTINATION ${pkgconfig_dir})
