# The game without a window in the machine of browsers: feltside-stylus under Node.js, for the tests.
set(FELTSIDE_SIBLINGS png toml file posix)
set(FELTSIDE_LIBRARIES FREETYPE PNG)
set(FELTSIDE_HELP_FOLDERS "")
add_compile_options(-fexceptions)
set(FELTSIDE_LINK_OPTIONS -fexceptions -sNODERAWFS=1 -sENVIRONMENT=node -sEXIT_RUNTIME=1
    -sALLOW_MEMORY_GROWTH=1)
