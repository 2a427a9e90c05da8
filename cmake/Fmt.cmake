# fmt, which fills in the sentences of diagnostics, reports and messages. Only its headers are used: so a cross build
# can use those of this machine, and the tool needs no shared library of fmt.
find_path(FMT_INCLUDE_DIR fmt/format.h REQUIRED)
add_library(fmt_headers INTERFACE)
target_include_directories(fmt_headers SYSTEM INTERFACE ${FMT_INCLUDE_DIR})
target_compile_definitions(fmt_headers INTERFACE FMT_HEADER_ONLY)
