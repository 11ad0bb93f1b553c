# Compile options of every target, as one interface library.
add_library(orvane_options INTERFACE)
target_compile_options(
  orvane_options
  INTERFACE -Wall
            -Wextra
            -Wconversion
            -Wshadow
            -Wformat=2
            -Wnon-virtual-dtor
            -Woverloaded-virtual
            $<$<BOOL:${ORVANE_WARNINGS_AS_ERRORS}>:-Werror>
            # With full optimisation g++ 12 warns of overlapping copies in "text" + std::string.
            $<$<AND:$<CONFIG:Release>,$<CXX_COMPILER_ID:GNU>>:-Wno-restrict>)

# lld links the programs in a quarter of the time. It does not know the objects of g++'s
# interprocedural optimisation; sanitized programs use the compiler's own linker.
find_program(ORVANE_LLD ld.lld)
if(ORVANE_LLD AND NOT CMAKE_INTERPROCEDURAL_OPTIMIZATION AND NOT ORVANE_SANITIZERS)
  target_link_options(orvane_options INTERFACE -fuse-ld=lld)
endif()

if(ORVANE_SANITIZERS)
  target_compile_options(
    orvane_options INTERFACE -fsanitize=${ORVANE_SANITIZERS} -fno-omit-frame-pointer
                             -fno-sanitize-recover=all)
  target_link_options(orvane_options INTERFACE -fsanitize=${ORVANE_SANITIZERS})
endif()

if(ORVANE_FUZZ)
  if(NOT CMAKE_CXX_COMPILER_ID MATCHES "Clang")
    message(FATAL_ERROR "ORVANE_FUZZ needs clang: cmake --preset fuzz, or -DCMAKE_CXX_COMPILER=clang++")
  endif()
  target_compile_options(
    orvane_options
    INTERFACE $<$<NOT:$<BOOL:$<TARGET_PROPERTY:ORVANE_NOT_FUZZED>>>:-fsanitize=fuzzer-no-link>)
  target_link_options(orvane_options INTERFACE -fsanitize=fuzzer-no-link)
endif()

if(ORVANE_COVERAGE)
  target_compile_options(orvane_options INTERFACE --coverage -O0)
  target_link_options(orvane_options INTERFACE --coverage)
endif()
