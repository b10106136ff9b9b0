# Three Debian packages of one build: the shared library, what a client is built with, the tool.
# `./dev package` configures with VESK_HDL_DEBIAN, which has put the prefix to /usr already, builds
# them with cpack and asks lintian.
find_program(DPKG_SHLIBDEPS dpkg-shlibdeps REQUIRED)
find_program(GZIP gzip REQUIRED)

set(CPACK_GENERATOR DEB)
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_COMPONENTS_ALL library development tool)
set(CPACK_COMPONENTS_GROUPING IGNORE)
set(CPACK_STRIP_FILES ON)
set(CPACK_PACKAGE_DIRECTORY ${PROJECT_BINARY_DIR})
set(CPACK_PACKAGE_CONTACT "Vesk HDL developers <developers@vesk-hdl.example>")
# The umask of the build does not count.
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
    OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)

set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_RELEASE 1)
set(version ${PROJECT_VERSION}-${CPACK_DEBIAN_PACKAGE_RELEASE})
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
# The tool needs our own library, which no installed package provides yet: it is named below.
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${PROJECT_BINARY_DIR}/vesk_hdl)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS_POLICY ">=")

# The descriptions below bring their own first lines.
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "")
set(about "Vesk HDL turns a stream of textual design-entry commands into a structural
netlist and writes that netlist as VHDL-93 or Verilog-95.")

set(CPACK_DEBIAN_LIBRARY_PACKAGE_NAME libvesk-hdl${PROJECT_VERSION_MAJOR})
set(CPACK_DEBIAN_LIBRARY_PACKAGE_SECTION libs)
set(CPACK_DEBIAN_LIBRARY_DESCRIPTION "structural netlists as VHDL and Verilog, library
${about}
.
This package holds the shared library.")
# cpack writes scripts that call ldconfig, where a trigger does, unless it is given others. It passes
# over names of no file.
set(CPACK_DEBIAN_LIBRARY_PACKAGE_CONTROL_EXTRA
    ${PROJECT_SOURCE_DIR}/cmake/debian/triggers /none/postinst /none/postrm)

set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_NAME libvesk-hdl-dev)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_DEPENDS
    "${CPACK_DEBIAN_LIBRARY_PACKAGE_NAME} (= ${version})")
set(CPACK_DEBIAN_DEVELOPMENT_DESCRIPTION "structural netlists as VHDL and Verilog, development files
${about}
.
This package holds the headers, the files for CMake and pkg-config, and an
example client.")

set(CPACK_DEBIAN_TOOL_PACKAGE_NAME vesk-hdl)
set(CPACK_DEBIAN_TOOL_PACKAGE_SECTION electronics)
set(CPACK_DEBIAN_TOOL_PACKAGE_DEPENDS "${CPACK_DEBIAN_LIBRARY_PACKAGE_NAME} (= ${version})")
set(CPACK_DEBIAN_TOOL_DESCRIPTION "structural netlists as VHDL and Verilog, command-line tool
${about}
.
This package holds the tool vesk-hdl, which runs command files, its manual and
example designs.")

# Installs a text compressed, as NAME.gz.
function(install_gzipped text package name destination component)
    set(made ${PROJECT_BINARY_DIR}/debian/${package}/${name})
    file(WRITE ${made} "${text}")
    execute_process(COMMAND ${GZIP} -9nf ${made} COMMAND_ERROR_IS_FATAL ANY)
    install(FILES ${made}.gz DESTINATION ${destination} COMPONENT ${component})
endfunction()

# What each package has to say about itself.
foreach(component IN LISTS CPACK_COMPONENTS_ALL)
    string(TOUPPER ${component} upper)
    set(package ${CPACK_DEBIAN_${upper}_PACKAGE_NAME})
    set(package_doc ${CMAKE_INSTALL_DATADIR}/doc/${package})
    file(READ ${PROJECT_SOURCE_DIR}/cmake/debian/changelog changelog)
    string(REPLACE PACKAGE ${package} changelog "${changelog}")
    if(NOT changelog MATCHES "^${package} \\(${version}\\)")
        message(FATAL_ERROR "cmake/debian/changelog does not begin with version ${version}")
    endif()
    install_gzipped("${changelog}" ${package} changelog.Debian ${package_doc} ${component})
    install(FILES ${PROJECT_SOURCE_DIR}/cmake/debian/copyright
        DESTINATION ${package_doc}
        COMPONENT ${component})
endforeach()

file(READ ${PROJECT_SOURCE_DIR}/docs/man/vesk-hdl.1 manual)
install_gzipped("${manual}" vesk-hdl vesk-hdl.1 ${CMAKE_INSTALL_MANDIR}/man1 tool)

include(CPack)
