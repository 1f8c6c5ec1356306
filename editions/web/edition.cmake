# For a page of a browser: as little as can be to fetch.
set(FELTSIDE_SIBLINGS web)
set(FELTSIDE_LIBRARIES FREETYPE)
# The page opens its help itself.
set(FELTSIDE_HELP_FOLDERS "")
set(PYTHON /usr/bin/python3)

# The letters that people write names with: Latin, Greek, Cyrillic. All other texts are the game's own,
# and those in bold are plain.
set(LETTERS_Regular U+0020-04FF,U+1E00-1EFF,U+2010-2044,U+20A0-20BF,U+2116,U+2122)
set(LETTERS_Bold U+0020-007E)

# Makes of the files in the lists `fonts` and `pictures` fonts with these letters alone and pictures with
# no need of a decoder, and sets the lists to those.
function(prepare_files)
  set(folder ${CMAKE_BINARY_DIR}/prepared)
  file(MAKE_DIRECTORY ${folder})
  set(made_fonts "")
  foreach(font IN LISTS fonts)
    cmake_path(GET font FILENAME name)
    string(REGEX MATCH "Regular|Bold" weight ${name})
    add_custom_command(
      OUTPUT ${folder}/${name}
      COMMAND ${PYTHON} -m fontTools.subset ${font} --output-file=${folder}/${name}
              --unicodes=${LETTERS_${weight}} --layout-features= --legacy-kern --notdef-outline
              --no-glyph-names --name-IDs=
              --drop-tables+=GSUB,GPOS,GDEF,FFTM,OS/2,post,gasp
      DEPENDS ${font} ${CMAKE_SOURCE_DIR}/editions/web/edition.cmake
      VERBATIM)
    list(APPEND made_fonts ${folder}/${name})
  endforeach()
  set(fonts ${made_fonts} PARENT_SCOPE)

  set(script ${CMAKE_SOURCE_DIR}/editions/web/plain_picture.py)
  set(made_pictures "")
  foreach(picture IN LISTS pictures)
    cmake_path(GET picture FILENAME name)
    list(APPEND made_pictures ${folder}/${name})
  endforeach()
  add_custom_command(OUTPUT ${made_pictures} COMMAND ${PYTHON} ${script} ${folder} ${pictures}
                     DEPENDS ${script} ${pictures} VERBATIM)
  set(pictures ${made_pictures} PARENT_SCOPE)
endfunction()
