# The reference of the public headers: target `reference`, which the test docs.reference makes. A warning
# of Doxygen is an error.
find_program(VESK_HDL_DOXYGEN doxygen)
set(VESK_HDL_REFERENCE_DIR ${PROJECT_BINARY_DIR}/docs CACHE PATH "Where the reference is made")
if(NOT VESK_HDL_DOXYGEN)
    return()
endif()

get_target_property(reference_inputs Vesk_Hdl HEADER_SET)
list(PREPEND reference_inputs ${PROJECT_SOURCE_DIR}/docs/reference.md)
list(JOIN reference_inputs " " reference_inputs)
configure_file(docs/Doxyfile.in ${PROJECT_BINARY_DIR}/Doxyfile @ONLY)

add_custom_target(reference
    COMMAND ${CMAKE_COMMAND} -E make_directory ${VESK_HDL_REFERENCE_DIR}
    COMMAND ${VESK_HDL_DOXYGEN} ${PROJECT_BINARY_DIR}/Doxyfile
    VERBATIM)
