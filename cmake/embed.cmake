# embed_files(OUT function file...): builds files into the program.
#
# OUT receives a source file that defines `function`, of type platform::EmbeddedFiles().
function(embed_files out function)
  string(REPLACE "::" "_" name "${function}")
  set(source "${CMAKE_BINARY_DIR}/embedded/${name}.cpp")
  add_custom_command(
    OUTPUT "${source}"
    COMMAND "${CMAKE_COMMAND}" "-DSOURCE=${source}" "-DFUNCTION=${function}" "-DFILES=${ARGN}"
            -P "${CMAKE_SOURCE_DIR}/cmake/embed_script.cmake"
    DEPENDS ${ARGN} "${CMAKE_SOURCE_DIR}/cmake/embed_script.cmake"
    VERBATIM)
  # Nothing but data: the sanitizers have nothing to look at there.
  set_source_files_properties("${source}" PROPERTIES COMPILE_OPTIONS "-O0;-fno-sanitize=all;-g0")
  set(${out} "${source}" PARENT_SCOPE)
endfunction()
