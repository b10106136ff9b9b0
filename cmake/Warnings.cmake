# The warnings of our own targets. They are linked PRIVATE, so that no client inherits them; whether
# they are errors is up to VESK_HDL_WERROR, which only our presets set.
add_library(vesk_hdl_warnings INTERFACE)

target_compile_options(vesk_hdl_warnings INTERFACE
    -Wall
    -Wextra
    -Wpedantic
    -Wconversion
    # Clang counts it to -Wconversion, GCC does not. Indexes are int here, standard sizes are not.
    -Wno-sign-conversion
    -Wcast-qual
    -Wold-style-cast
    -Wnon-virtual-dtor
    -Woverloaded-virtual
    -Wformat=2
    # Messages come from tables, too; a format without arguments still has to be a literal.
    -Wno-format-nonliteral
    -Wimplicit-fallthrough
    -Wundef)

if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU")
    target_compile_options(vesk_hdl_warnings INTERFACE
        # Not of members: an argument may be called like the private field of a base class.
        -Wshadow=local
        -Wduplicated-cond
        -Wlogical-op
        # GCC 12 reports overlapping copies inside std::string where there are none.
        -Wno-restrict)
    if(VESK_HDL_SANITIZE)
        # The instrumentation hides initialisations from GCC 12, those in <regex> for one.
        target_compile_options(vesk_hdl_warnings INTERFACE -Wno-maybe-uninitialized)
    endif()
else()
    target_compile_options(vesk_hdl_warnings INTERFACE -Wshadow)
endif()

if(VESK_HDL_WERROR)
    target_compile_options(vesk_hdl_warnings INTERFACE -Werror)
endif()
