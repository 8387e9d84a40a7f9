# The same bytes from the same sources, wherever and whenever they are built: what is shipped links
# qorn_reproducible_options.

include_guard(GLOBAL)

add_library(qorn_reproducible_options INTERFACE)

# Origins hold the name of their file, which shall begin at the project's folder; ccache may name it
# from the build's. Where debuggers and coverage look for the sources the full names stay.
cmake_path(RELATIVE_PATH PROJECT_SOURCE_DIR BASE_DIRECTORY ${CMAKE_BINARY_DIR}
  OUTPUT_VARIABLE QORN_SOURCES_FROM_BUILD)
foreach(folder IN ITEMS ${PROJECT_SOURCE_DIR} ${QORN_SOURCES_FROM_BUILD})
  target_compile_options(qorn_reproducible_options INTERFACE
    $<$<NOT:$<CONFIG:Debug,RelWithDebInfo>>:-ffile-prefix-map=${folder}/=>)
endforeach()

# Origins hold the build's date and time too. clang 14 takes neither from the environment, and
# ccache may be told to overlook both; on the command line they are seen by all. TIMESTAMP honours
# the same variable.
if(DEFINED ENV{SOURCE_DATE_EPOCH})
  string(TIMESTAMP date "%b %d %Y" UTC)
  string(REPLACE " 0" "  " date ${date})
  string(TIMESTAMP time "%H:%M:%S" UTC)
  target_compile_definitions(qorn_reproducible_options INTERFACE
    "__DATE__=\"${date}\"" "__TIME__=\"${time}\"")
  target_compile_options(qorn_reproducible_options INTERFACE -Wno-builtin-macro-redefined)
endif()
