# For a page of a browser.
set(FELTSIDE_SIBLINGS png web)
set(FELTSIDE_LIBRARIES FREETYPE PNG)
# The page opens its help itself.
set(FELTSIDE_HELP_FOLDER "")
