# One switch for all targets: -DVESK_HDL_SANITIZE="address;undefined". Everything that is loaded into
# one process has to be built alike, so each of our targets links vesk_hdl_sanitizers. A client of
# such a build gives VESK_HDL_SANITIZE_FLAGS to its compiler, as tests/package does.
add_library(vesk_hdl_sanitizers INTERFACE)

set(VESK_HDL_SANITIZE_FLAGS "")
if(VESK_HDL_SANITIZE)
    list(JOIN VESK_HDL_SANITIZE "," sanitizers)
    set(VESK_HDL_SANITIZE_FLAGS "-fsanitize=${sanitizers}")
    target_compile_options(vesk_hdl_sanitizers INTERFACE
        ${VESK_HDL_SANITIZE_FLAGS}
        -fno-sanitize-recover=all
        -fno-omit-frame-pointer)
    target_link_options(vesk_hdl_sanitizers INTERFACE ${VESK_HDL_SANITIZE_FLAGS})
endif()
