# axvelto_string_table(<target> <folder of .txt sources> <output folder, relative to the build tree>
#                      [NO_INSTALL])
# compiles one ICU resource bundle per language and installs them under the same relative folder.

find_program(GENRB genrb REQUIRED)

function(axvelto_string_table target sources output)
  file(GLOB texts CONFIGURE_DEPENDS ${sources}/*.txt)
  set(compiled)
  foreach(text ${texts})
    get_filename_component(language ${text} NAME_WE)
    set(result ${CMAKE_BINARY_DIR}/${output}/${language}.res)
    add_custom_command(
      OUTPUT ${result}
      COMMAND ${CMAKE_COMMAND} -E make_directory ${CMAKE_BINARY_DIR}/${output}
      COMMAND ${GENRB} --quiet --encoding UTF-8 --destdir ${CMAKE_BINARY_DIR}/${output} ${text}
      DEPENDS ${text}
      VERBATIM)
    list(APPEND compiled ${result})
  endforeach()
  string(MAKE_C_IDENTIFIER "${target}-${output}" name)
  add_custom_target(${name} ALL DEPENDS ${compiled})
  add_dependencies(${target} ${name})
  if(NOT "NO_INSTALL" IN_LIST ARGN)
    install(FILES ${compiled} DESTINATION ${output})
  endif()
endfunction()
