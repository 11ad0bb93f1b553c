# Makes full builds cheap, for the presets that nobody edits in (ORVANE_BATCHES): the headers of the
# standard library are precompiled, and the tests are compiled several files at once. The preset dev
# does neither: it finds a missing include, and a changed file is compiled alone.

if(ORVANE_BATCHES)
  file(CONFIGURE OUTPUT ${CMAKE_BINARY_DIR}/precompiled.cpp CONTENT "")
  add_library(orvane_precompiled STATIC ${CMAKE_BINARY_DIR}/precompiled.cpp)
  target_link_libraries(orvane_precompiled PRIVATE orvane_options)
  target_precompile_headers(
    orvane_precompiled
    PRIVATE <algorithm>
            <array>
            <chrono>
            <cstdint>
            <functional>
            <map>
            <memory>
            <optional>
            <span>
            <string>
            <string_view>
            <utility>
            <vector>)
  # The compiler cache recognises a precompiled header only without its time.
  target_compile_options(
    orvane_precompiled PRIVATE $<$<CXX_COMPILER_ID:Clang>:SHELL:-Xclang -fno-pch-timestamp>)
endif()

# Gives a target the precompiled headers. Its compile options must be those of the layers.
function(orvane_precompile target)
  if(ORVANE_BATCHES)
    target_precompile_headers(${target} REUSE_FROM orvane_precompiled)
  endif()
endfunction()

# Compiles the test files of a target several at once. Each file is put in a namespace of its own
# below orvane, so that files may use the same names: `orvane` becomes a macro after every header
# that the files include is included. A target with a file to which that cannot be done, because it
# uses the word otherwise, is compiled file by file.
function(orvane_batch_tests target)
  if(NOT ORVANE_BATCHES)
    return()
  endif()
  get_target_property(sources ${target} SOURCES)
  # A changed include changes the header below.
  set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${sources})
  set(includes)
  foreach(source IN LISTS sources)
    file(STRINGS ${source} lines REGEX "^#include ")
    list(APPEND includes ${lines})
  endforeach()
  list(REMOVE_DUPLICATES includes)
  list(JOIN includes "\n" includes)
  set(header ${CMAKE_CURRENT_BINARY_DIR}/${target}_includes.h)
  file(CONFIGURE OUTPUT ${header} CONTENT "#pragma once\n${includes}\n" @ONLY)
  set_target_properties(
    ${target}
    PROPERTIES UNITY_BUILD ON
               UNITY_BUILD_BATCH_SIZE 12
               UNITY_BUILD_UNIQUE_ID ORVANE_TEST_FILE
               UNITY_BUILD_CODE_BEFORE_INCLUDE
               "#undef orvane
#include \"${header}\"
namespace orvane::ORVANE_TEST_FILE { using namespace orvane; }
#define orvane orvane::ORVANE_TEST_FILE")
endfunction()
