# For a desktop with the system's own libraries.
set(FELTSIDE_SIBLINGS sdl png toml file posix)
# Only the parts in use are linked and loaded: two megabytes less in memory.
set(FELTSIDE_LINK_OPTIONS -static-libstdc++ -static-libgcc -Wl,--gc-sections)
# As seen from the program, so that a built package names no folder of the machine that built it.
file(RELATIVE_PATH source_help ${CMAKE_BINARY_DIR} ${CMAKE_SOURCE_DIR}/help)
set(FELTSIDE_HELP_FOLDERS ../share/feltside/help ${source_help})
