# Lays the page's files around the program in SITE: its own, the help, the icons, the licences and the
# sources. The version is what all of them amount to.
set(page ${ROOT}/editions/web/page)
# What an earlier version had there is not this one's.
file(REMOVE_RECURSE ${SITE}/help ${SITE}/icons ${SITE}/licences)
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
# Out of a repository, only what is kept in it.
set(sources .)
if(EXISTS ${ROOT}/.git)
  execute_process(COMMAND git ls-files WORKING_DIRECTORY ${ROOT} OUTPUT_FILE ${SITE}/../sources.txt
                  COMMAND_ERROR_IS_FATAL ANY)
  set(sources --files-from=${SITE}/../sources.txt)
endif()
execute_process(
  COMMAND tar --create --gzip --file ${SITE}/feltside-sources.tar.gz --transform "s,^\\(\\./\\)*,feltside/,"
          --exclude=./build --exclude=./.git --exclude=__pycache__ ${sources}
  WORKING_DIRECTORY ${ROOT} COMMAND_ERROR_IS_FATAL ANY)

set(sums "")
foreach(file IN LISTS files)
  file(SHA256 ${SITE}/${file} sum)
  string(APPEND sums "  '${file}': '${sum}',\n")
endforeach()
set(FILES ${sums})
foreach(name index.html worker.js)
  file(SHA256 ${page}/${name}.in sum)
  string(APPEND sums "${sum}\n")
endforeach()
string(SHA256 VERSION "${sums}")
string(SUBSTRING ${VERSION} 0 12 VERSION)

configure_file(${page}/index.html.in ${SITE}/index.html @ONLY)
file(SHA256 ${SITE}/index.html sum)
string(APPEND FILES "  './': '${sum}',")
configure_file(${page}/worker.js.in ${SITE}/worker.js @ONLY)
