# For a desktop with the system's own libraries.
set(FELTSIDE_SIBLINGS sdl file posix)
# Only the parts in use are linked and loaded: two megabytes less in memory.
set(FELTSIDE_LINK_OPTIONS -static-libstdc++ -static-libgcc -Wl,--gc-sections)
