# Lays the page's files around the program in SITE: its own, the help, the icons, the licences. The
# version is what all of them amount to.
set(page ${ROOT}/editions/web/page)
file(COPY ${page}/feltside.css ${page}/feltside.webmanifest ${ROOT}/editions/web/icons ${ROOT}/help
     DESTINATION ${SITE})

file(GLOB_RECURSE files LIST_DIRECTORIES false RELATIVE ${SITE} ${SITE}/*)
list(REMOVE_ITEM files index.html worker.js)
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
