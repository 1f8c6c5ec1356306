# Writes SOURCE: the bytes of FILES as arrays, listed by FUNCTION.
string(REGEX MATCH "^[a-z]+" namespace "${FUNCTION}")
string(REGEX REPLACE "^.*::" "" name "${FUNCTION}")
set(arrays "")
set(entries "")
set(number 0)
foreach(file IN LISTS FILES)
  get_filename_component(base "${file}" NAME)
  file(READ "${file}" bytes HEX)
  string(REGEX REPLACE "([0-9a-f][0-9a-f])" "0x\\1," bytes "${bytes}")
  string(APPEND arrays "const unsigned char kFile${number}[] = {${bytes}};\n")
  string(APPEND entries "    {\"${base}\", kFile${number}, sizeof kFile${number}},\n")
  math(EXPR number "${number} + 1")
endforeach()
file(WRITE "${SOURCE}" "#include \"platform/draw/embedded.h\"

namespace ${namespace} {
namespace {

${arrays}
const platform::EmbeddedFile kFiles[] = {
${entries}};

}  // namespace

platform::EmbeddedFiles ${name}() { return {kFiles, ${number}}; }

}  // namespace ${namespace}
")
