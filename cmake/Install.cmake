# What an installation holds: the library, its public headers, the tool, and the two ways to find the
# library (CMake package and pkg-config). Both work out the prefix from their own place, so that an
# installation may be moved as a whole. The components are library, development and tool.
include(CMakePackageConfigHelpers)

set(package_dir ${CMAKE_INSTALL_LIBDIR}/cmake/Vesk_Hdl)
set(pkgconfig_dir ${CMAKE_INSTALL_LIBDIR}/pkgconfig)

install(TARGETS Vesk_Hdl
    EXPORT Vesk_HdlTargets
    LIBRARY COMPONENT library NAMELINK_COMPONENT development
    FILE_SET HEADERS COMPONENT development)
install(DIRECTORY ${PROJECT_SOURCE_DIR}/examples/client
    DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/libvesk-hdl-dev/examples
    COMPONENT development)

if(VESK_HDL_BUILD_TOOL)
    set(tool_doc_dir ${CMAKE_INSTALL_DATADIR}/doc/vesk-hdl)
    install(TARGETS vesk-hdl COMPONENT tool)
    if(NOT VESK_HDL_DEBIAN) # there it is compressed
        install(FILES ${PROJECT_SOURCE_DIR}/docs/man/vesk-hdl.1
            DESTINATION ${CMAKE_INSTALL_MANDIR}/man1
            COMPONENT tool)
    endif()
    # Beside each other, as in the source tree: the pages lead to the examples.
    install(DIRECTORY ${PROJECT_SOURCE_DIR}/docs
        DESTINATION ${tool_doc_dir}
        COMPONENT tool
        FILES_MATCHING PATTERN *.md PATTERN *.svg
        PATTERN man EXCLUDE)
    install(DIRECTORY ${PROJECT_SOURCE_DIR}/examples
        DESTINATION ${tool_doc_dir}
        COMPONENT tool)
endif()

install(EXPORT Vesk_HdlTargets
    NAMESPACE Vesk_Hdl::
    DESTINATION ${package_dir}
    COMPONENT development)
configure_package_config_file(
    ${PROJECT_SOURCE_DIR}/cmake/Vesk_HdlConfig.cmake.in
    ${PROJECT_BINARY_DIR}/Vesk_HdlConfig.cmake
    INSTALL_DESTINATION ${package_dir})
# As with the SOVERSION, a release can replace any other one of its major version.
write_basic_package_version_file(
    ${PROJECT_BINARY_DIR}/Vesk_HdlConfigVersion.cmake
    COMPATIBILITY SameMajorVersion)
install(FILES
    ${PROJECT_BINARY_DIR}/Vesk_HdlConfig.cmake
    ${PROJECT_BINARY_DIR}/Vesk_HdlConfigVersion.cmake
    DESTINATION ${package_dir}
    COMPONENT development)

# Names for vesk_hdl.pc: from its folder up to the prefix, and from there down again. A folder given
# as an absolute path (distributions do that) stays as it is, and so does a package's prefix, whose
# folders pkg-config then knows to be those of the system.
set(pc_prefix ${CMAKE_INSTALL_PREFIX})
if(NOT IS_ABSOLUTE ${CMAKE_INSTALL_LIBDIR} AND NOT VESK_HDL_DEBIAN)
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
install(FILES ${PROJECT_BINARY_DIR}/vesk_hdl.pc
    DESTINATION ${pkgconfig_dir}
    COMPONENT development)
