# Builds every layer, but no program and no test.
add_custom_target(layers)

# Makes a layer: a static library orvane_NAME of the sources below FOLDER, without the folders of
# other layers, of app/program/ and of the programs' main.cpp.
#
# A layer sees only the headers of the layers after USES and of those that they use: each layer has
# an include directory of its own, which holds only a link to its folder. tests/layers makes
# its cases from the properties ORVANE_LAYERS, ORVANE_FOLDER_<name> and ORVANE_SEES_<name>.
function(orvane_layer name)
  cmake_parse_arguments(LAYER "" "FOLDER" "USES" ${ARGN})

  file(GLOB_RECURSE sources CONFIGURE_DEPENDS ${CMAKE_SOURCE_DIR}/${LAYER_FOLDER}/*.cpp)
  list(FILTER sources EXCLUDE REGEX "/main\\.cpp$|/app/program/")
  get_property(layers GLOBAL PROPERTY ORVANE_LAYERS)
  foreach(other IN LISTS layers)
    get_property(folder GLOBAL PROPERTY ORVANE_FOLDER_${other})
    list(FILTER sources EXCLUDE REGEX "^${CMAKE_SOURCE_DIR}/${folder}/")
  endforeach()

  set(includes ${CMAKE_BINARY_DIR}/include/${name})
  cmake_path(GET LAYER_FOLDER PARENT_PATH parent)
  file(MAKE_DIRECTORY ${includes}/${parent})
  file(CREATE_LINK ${CMAKE_SOURCE_DIR}/${LAYER_FOLDER} ${includes}/${LAYER_FOLDER} SYMBOLIC)

  add_library(orvane_${name} STATIC ${sources})
  target_include_directories(orvane_${name} PUBLIC ${includes})
  set(sees)
  foreach(used IN LISTS LAYER_USES)
    target_link_libraries(orvane_${name} PUBLIC orvane_${used})
    get_property(further GLOBAL PROPERTY ORVANE_SEES_${used})
    list(APPEND sees ${used} ${further})
  endforeach()
  list(REMOVE_DUPLICATES sees)
  target_link_libraries(orvane_${name} PRIVATE orvane_options)
  orvane_precompile(orvane_${name})
  add_dependencies(layers orvane_${name})

  set_property(GLOBAL APPEND PROPERTY ORVANE_LAYERS ${name})
  set_property(GLOBAL PROPERTY ORVANE_FOLDER_${name} ${LAYER_FOLDER})
  set_property(GLOBAL PROPERTY ORVANE_SEES_${name} "${sees}")
endfunction()
