# How a target of this project is made: language level, warnings, visibility, sanitizers.

include_guard(GLOBAL)
include(QornReproducible)

set(CMAKE_CXX_VISIBILITY_PRESET hidden)
set(CMAKE_OBJCXX_VISIBILITY_PRESET hidden)
set(CMAKE_VISIBILITY_INLINES_HIDDEN ON)
set(CMAKE_POSITION_INDEPENDENT_CODE ON)

find_program(QORN_CCACHE ccache)
mark_as_advanced(QORN_CCACHE)
if(QORN_CCACHE AND PROJECT_IS_TOP_LEVEL AND NOT CMAKE_CXX_COMPILER_LAUNCHER)
  set(CMAKE_CXX_COMPILER_LAUNCHER ${QORN_CCACHE})
endif()

# Nothing of the floors is exported, so that none could be linked against as a shared library.
if(BUILD_SHARED_LIBS AND PROJECT_IS_TOP_LEVEL)
  message(NOTICE "BUILD_SHARED_LIBS changes nothing: the foundation's libraries are static")
endif()

# What every target of this project is compiled and linked with, and nobody else's.
add_library(qorn_build_options INTERFACE)
target_compile_features(qorn_build_options INTERFACE cxx_std_17)
target_compile_options(qorn_build_options INTERFACE
  -Wall -Wextra -Wpedantic -Wconversion -Wshadow
  $<$<BOOL:${QORN_WARNINGS_AS_ERRORS}>:-Werror>)
if(QORN_SANITIZE)
  target_compile_options(qorn_build_options INTERFACE
    -fsanitize=${QORN_SANITIZE} -fno-sanitize-recover=all -fno-omit-frame-pointer)
  target_link_options(qorn_build_options INTERFACE -fsanitize=${QORN_SANITIZE})
endif()
if(QORN_COVERAGE)
  set(instrumentation -fprofile-instr-generate -fcoverage-mapping)
  target_compile_options(qorn_build_options INTERFACE ${instrumentation})
  target_link_options(qorn_build_options INTERFACE ${instrumentation})
endif()

# qorn_add_floor(<name>): the static library qorn_<name> with the alias qorn::<name>.
function(qorn_add_floor name)
  add_library(qorn_${name} STATIC)
  add_library(qorn::${name} ALIAS qorn_${name})
  target_compile_features(qorn_${name} PUBLIC cxx_std_17)
  target_include_directories(qorn_${name} PUBLIC $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/src>)
  target_link_libraries(qorn_${name} PRIVATE
    $<BUILD_INTERFACE:qorn_reproducible_options> $<BUILD_INTERFACE:qorn_build_options>)
endfunction()
