# The layers of the program. pelmar_layer(NAME FOLDERS folder... [DEPENDS layer...] [LINKS target...])
# makes the library pelmar_NAME of the sources in the folders (under src/), linked to the layers
# it depends on. A source may include the headers of its own folders and of the layers below
# it, nothing else: the build checks every include before it compiles the layer, so an upward
# include or a cycle fails the build.

set(PELMAR_LAYER_CHECK ${CMAKE_CURRENT_LIST_DIR}/CheckLayers.cmake)

# The sources of folders (relative to root) and the folders a target may include.
function(pelmar_sources out root)
  set(sources)
  foreach(folder ${ARGN})
    file(GLOB found CONFIGURE_DEPENDS ${root}/${folder}/*.cpp ${root}/${folder}/*.h)
    list(APPEND sources ${found})
  endforeach()
  set(${out} ${sources} PARENT_SCOPE)
endfunction()

function(pelmar_allowed out)
  cmake_parse_arguments(A "" "" "FOLDERS;DEPENDS" ${ARGN})
  set(allowed ${A_FOLDERS})
  foreach(dependency ${A_DEPENDS})
    get_property(below GLOBAL PROPERTY PELMAR_LAYER_${dependency})
    list(APPEND allowed ${below})
  endforeach()
  list(REMOVE_DUPLICATES allowed)
  set(${out} ${allowed} PARENT_SCOPE)
endfunction()

# Adds a step to target that checks the includes of sources against the allowed folders.
function(pelmar_check_includes target sources allowed)
  set(list_file ${CMAKE_BINARY_DIR}/layers/${target}.cmake)
  file(GENERATE OUTPUT ${list_file} CONTENT "set(ALLOWED \"${allowed}\")\nset(SOURCES \"${sources}\")\n")
  set(stamp ${CMAKE_BINARY_DIR}/layers/${target}.checked)
  add_custom_command(OUTPUT ${stamp}
    COMMAND ${CMAKE_COMMAND} -DLAYER=${target} -DLIST=${list_file} -P ${PELMAR_LAYER_CHECK}
    COMMAND ${CMAKE_COMMAND} -E touch ${stamp}
    DEPENDS ${sources} ${list_file} ${PELMAR_LAYER_CHECK}
    COMMENT "Checking the includes of ${target}" VERBATIM)
  add_custom_target(${target}_layer_check DEPENDS ${stamp})
  add_dependencies(${target} ${target}_layer_check)
endfunction()

function(pelmar_layer name)
  cmake_parse_arguments(L "" "" "FOLDERS;DEPENDS;LINKS" ${ARGN})
  pelmar_sources(sources ${PROJECT_SOURCE_DIR}/src ${L_FOLDERS})
  add_library(pelmar_${name} STATIC ${sources})
  target_include_directories(pelmar_${name} PUBLIC ${PROJECT_SOURCE_DIR}/src)
  list(TRANSFORM L_DEPENDS PREPEND pelmar_ OUTPUT_VARIABLE dependencies)
  target_link_libraries(pelmar_${name} PUBLIC ${dependencies} ${L_LINKS})
  pelmar_allowed(allowed FOLDERS ${L_FOLDERS} DEPENDS ${L_DEPENDS})
  set_property(GLOBAL PROPERTY PELMAR_LAYER_${name} ${allowed})
  pelmar_check_includes(pelmar_${name} "${sources}" "${allowed}")
endfunction()

function(pelmar_executable name)
  cmake_parse_arguments(L "" "" "FOLDERS;DEPENDS" ${ARGN})
  pelmar_sources(sources ${PROJECT_SOURCE_DIR}/src ${L_FOLDERS})
  add_executable(${name} ${sources})
  list(TRANSFORM L_DEPENDS PREPEND pelmar_ OUTPUT_VARIABLE dependencies)
  target_link_libraries(${name} PRIVATE ${dependencies})
  pelmar_allowed(allowed FOLDERS ${L_FOLDERS} DEPENDS ${L_DEPENDS})
  pelmar_check_includes(${name} "${sources}" "${allowed}")
endfunction()
