# For Windows: one program that needs nothing installed.
set(FELTSIDE_SIBLINGS sdl png toml file windows)
set(FELTSIDE_LIBRARIES SDL2 FREETYPE PNG)
set(FELTSIDE_LINK_OPTIONS -static -s -Wl,--gc-sections)
# Beside the program.
set(FELTSIDE_HELP_FOLDERS help)
