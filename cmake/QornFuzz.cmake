# qorn_add_fuzzer(<name> SOURCES ... LIBRARIES ...)
#
# A fuzz target: a source with LLVMFuzzerTestOneInput. With QORN_BUILD_FUZZERS it becomes a libFuzzer
# program in <build>/fuzz, which scripts/fuzz runs; by hand it is
#
#     build/fuzz/fuzz/<name> -max_total_time=180 fuzz/corpus/<name>
#
# With QORN_BUILD_TESTS it becomes a CTest test that runs it once over each file of its corpus.

include_guard(GLOBAL)

if(QORN_BUILD_FUZZERS)
  if(NOT CMAKE_CXX_COMPILER_ID MATCHES Clang)
    message(FATAL_ERROR "The fuzz targets need clang: use the preset \"fuzz\"")
  endif()
  # The libraries count their branches too, or the fuzzer would see nothing of them.
  target_compile_options(qorn_build_options INTERFACE -fsanitize=fuzzer-no-link)
endif()

function(qorn_add_fuzzer name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "SOURCES;LIBRARIES")
  if(QORN_BUILD_FUZZERS)
    add_executable(${name} ${arg_SOURCES})
    target_link_options(${name} PRIVATE -fsanitize=fuzzer)
    set_target_properties(${name} PROPERTIES
      RUNTIME_OUTPUT_DIRECTORY ${PROJECT_BINARY_DIR}/fuzz)
    target_include_directories(${name} PRIVATE ${PROJECT_SOURCE_DIR}/tests)
    target_link_libraries(${name} PRIVATE ${arg_LIBRARIES} qorn_build_options)
  endif()
  if(QORN_BUILD_TESTS)
    add_executable(${name}Corpus ${arg_SOURCES} ${PROJECT_SOURCE_DIR}/tests/fuzz/FuzzCorpus.cpp)
    if(QORN_SANITIZE)
      target_sources(${name}Corpus PRIVATE ${PROJECT_SOURCE_DIR}/tests/support/SanitizerOptions.cpp)
    endif()
    target_include_directories(${name}Corpus PRIVATE ${PROJECT_SOURCE_DIR}/tests)
    target_link_libraries(${name}Corpus PRIVATE ${arg_LIBRARIES} qorn_build_options)
    add_test(NAME ${name}.CorpusRunsThrough
      COMMAND ${name}Corpus ${PROJECT_SOURCE_DIR}/fuzz/corpus/${name})
  endif()
endfunction()
