# The packages that Feltside needs, in one place for `play` and `check`.
#
# Each line: the Debian package, and how to see on any other system that what it brings is there:
#   command NAME   a program in the path
#   module NAME    a module that pkg-config knows
#   header NAME    a header where the compiler looks for it
#   font NAME      a font file where the build looks for it
#   python NAME    a module that python3 can import
#   helper NAME    a program that the game starts where there is one, and does without elsewhere

play_packages='
  cmake                command  cmake
  ninja-build          command  ninja
  g++                  command  c++
  pkg-config           command  pkg-config
  libsdl2-dev          module   sdl2
  libfreetype-dev      module   freetype2
  libpng-dev           module   libpng
  libtomlplusplus-dev  module   tomlplusplus
  libutfcpp-dev        header   utf8cpp/utf8.h
  nlohmann-json3-dev   module   nlohmann_json
  fonts-liberation     font     LiberationSans-Regular.ttf
  xdg-utils            helper   xdg-open
'

check_packages="$play_packages"'
  clang                command  clang++
  clang-tidy           command  clang-tidy
  clang-format         command  clang-format
  libgtest-dev         module   gtest
  libgmock-dev         module   gmock
  tidy                 command  tidy
  python3              command  python3
  python3-pil          python   PIL
'
