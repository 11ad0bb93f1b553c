# Builds every layer and nothing else.
add_custom_target(layers)

# One static library a layer. A layer sees the headers of the layers that it names under USES and no
# others: each has an include directory of its own that holds nothing but a link to its folder, so
# `#include "app/OrvaneModel.h"` below LogGenerator/ fails to build.
function(orvane_layer name)
  cmake_parse_arguments(LAYER "RECURSIVE" "FOLDER" "USES" ${ARGN})
  if(LAYER_RECURSIVE)
    set(glob GLOB_RECURSE)
  else()
    set(glob GLOB)
  endif()
  file(${glob} sources CONFIGURE_DEPENDS ${CMAKE_SOURCE_DIR}/${LAYER_FOLDER}/*.cpp)
  list(FILTER sources EXCLUDE REGEX "/main\\.cpp$")

  set(includes ${CMAKE_BINARY_DIR}/include/${name})
  cmake_path(GET LAYER_FOLDER PARENT_PATH parent)
  file(MAKE_DIRECTORY ${includes}/${parent})
  file(CREATE_LINK ${CMAKE_SOURCE_DIR}/${LAYER_FOLDER} ${includes}/${LAYER_FOLDER} SYMBOLIC)

  add_library(orvane_${name} STATIC ${sources})
  target_include_directories(orvane_${name} PUBLIC ${includes})
  foreach(used IN LISTS LAYER_USES)
    target_link_libraries(orvane_${name} PUBLIC orvane_${used})
  endforeach()
  target_link_libraries(orvane_${name} PRIVATE orvane_options)
  add_dependencies(layers orvane_${name})
endfunction()
