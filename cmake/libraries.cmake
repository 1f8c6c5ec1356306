# The libraries that the game stands on: FELTSIDE::SDL2, FELTSIDE::FREETYPE, FELTSIDE::PNG and, for
# those that are headers only, FELTSIDE::HEADERS.

# desktop_library(NAME MODULE): one of the system's own.
function(desktop_library name module)
  pkg_check_modules(${name} REQUIRED IMPORTED_TARGET GLOBAL ${module})
  add_library(FELTSIDE::${name} ALIAS PkgConfig::${name})
endfunction()

if(FELTSIDE_LIBRARIES)
  add_subdirectory(editions/libraries)
else()
  find_package(PkgConfig REQUIRED)
  desktop_library(SDL2 sdl2>=2.26)
  desktop_library(FREETYPE freetype2)
  desktop_library(PNG libpng>=1.6)
endif()

# Seen through a folder of links, as the folder that has them may have headers of another machine.
add_library(headers INTERFACE)
add_library(FELTSIDE::HEADERS ALIAS headers)
target_include_directories(headers SYSTEM INTERFACE ${CMAKE_BINARY_DIR}/headers)
file(MAKE_DIRECTORY ${CMAKE_BINARY_DIR}/headers)
foreach(header toml++/toml.h utf8cpp/utf8.h nlohmann/json.hpp)
  cmake_path(GET header PARENT_PATH folder)
  find_path(HEADERS_${folder} ${header} NO_CMAKE_FIND_ROOT_PATH REQUIRED)
  file(CREATE_LINK ${HEADERS_${folder}}/${folder} ${CMAKE_BINARY_DIR}/headers/${folder} SYMBOLIC)
endforeach()
