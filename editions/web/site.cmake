# Lays the page's files around the program in SITE: its own, the help, the icons, the licences and the
# sources. The version is what all of them amount to.
set(page ${ROOT}/editions/web/page)
file(COPY ${page}/feltside.css ${page}/feltside.webmanifest ${page}/licences.html
     ${ROOT}/editions/web/icons ${ROOT}/help DESTINATION ${SITE})
# What is played without a network.
file(GLOB_RECURSE files LIST_DIRECTORIES false RELATIVE ${SITE}
     ${SITE}/feltside.* ${SITE}/licences.html ${SITE}/icons/* ${SITE}/help/*)

configure_file(${ROOT}/LICENSE ${SITE}/licences/feltside.txt COPYONLY)
configure_file(${ROOT}/build/libraries/freetype/debian/copyright ${SITE}/licences/freetype.txt COPYONLY)
foreach(package emscripten fonts-liberation libutfcpp-dev)
  configure_file(/usr/share/doc/${package}/copyright ${SITE}/licences/${package}.txt COPYONLY)
endforeach()
execute_process(
  COMMAND tar --create --gzip --file ${SITE}/feltside-sources.tar.gz --transform s,^\\.,feltside,
          --exclude=./build --exclude=./.git --exclude=__pycache__ .
  WORKING_DIRECTORY ${ROOT} COMMAND_ERROR_IS_FATAL ANY)

set(sums "")
foreach(file IN LISTS files)
  file(SHA256 ${SITE}/${file} sum)
  string(APPEND sums "${file} ${sum}\n")
endforeach()
foreach(name index.html worker.js)
  file(SHA256 ${page}/${name}.in sum)
  string(APPEND sums "${sum}\n")
endforeach()
string(SHA256 VERSION "${sums}")
string(SUBSTRING ${VERSION} 0 12 VERSION)

list(JOIN files "',\n  '" FILES)
set(FILES "  './',\n  '${FILES}',")
configure_file(${page}/index.html.in ${SITE}/index.html @ONLY)
configure_file(${page}/worker.js.in ${SITE}/worker.js @ONLY)
