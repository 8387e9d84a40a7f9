# qorn_add_java(<name> [CLASSPATH <jar>] [JAR <file>] SOURCES ...)
#
# The target <name> compiles Java sources into the folder java/<name> of the build, which it owns.
# JAR packs them into java/<file>, whose manifest bears the project's version.

# Not GLOBAL: each folder that uses it needs the variable.
include_guard()

# In the "C" locale a Java machine loses every path that is not ASCII. Not every macOS has C.UTF-8.
if(APPLE)
  set(QORN_JAVA_LOCALE LC_ALL=en_US.UTF-8)
else()
  set(QORN_JAVA_LOCALE LC_ALL=C.UTF-8)
endif()

function(qorn_add_java name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "CLASSPATH;JAR" "SOURCES")
  if(arg_CLASSPATH)
    set(class_path -cp ${arg_CLASSPATH})
  endif()
  list(TRANSFORM arg_SOURCES PREPEND ${CMAKE_CURRENT_SOURCE_DIR}/)
  set(classes ${PROJECT_BINARY_DIR}/java/${name})
  set(stamp ${CMAKE_CURRENT_BINARY_DIR}/${name}.stamp)
  add_custom_command(OUTPUT ${stamp}
    COMMAND ${CMAKE_COMMAND} -E rm -rf ${classes} ${stamp}
    COMMAND ${CMAKE_COMMAND} -E make_directory ${classes}
    COMMAND ${CMAKE_COMMAND} -E env ${QORN_JAVA_LOCALE} ${Java_JAVAC_EXECUTABLE}
            --release 11 -encoding UTF-8 -Xlint:all -Werror ${class_path} -d ${classes} ${arg_SOURCES}
    COMMAND ${CMAKE_COMMAND} -E touch ${stamp}
    DEPENDS ${arg_SOURCES}
    COMMENT "Compiling Java ${name}"
    VERBATIM)
  add_custom_target(${name} ALL DEPENDS ${stamp})
  if(arg_JAR)
    qorn_add_jar_(${name} ${stamp} ${classes} ${PROJECT_BINARY_DIR}/java/${arg_JAR})
  endif()
endfunction()

# jar knows of --date since Java 17; it takes no earlier one than that of the year 1980.
function(qorn_add_jar_ name stamp classes jar)
  set(manifest ${CMAKE_CURRENT_BINARY_DIR}/${name}.manifest)
  file(CONFIGURE OUTPUT ${manifest} CONTENT
    "Implementation-Title: @PROJECT_NAME@\nImplementation-Version: @PROJECT_VERSION@\n" @ONLY)
  set(date)
  if(DEFINED ENV{SOURCE_DATE_EPOCH} AND Java_VERSION VERSION_GREATER_EQUAL 17)
    string(TIMESTAMP date "%Y-%m-%dT%H:%M:%SZ" UTC)
    set(date --date=${date})
  endif()
  add_custom_command(OUTPUT ${jar}
    COMMAND ${CMAKE_COMMAND} -E env ${QORN_JAVA_LOCALE} ${Java_JAR_EXECUTABLE}
            --create --file ${jar} --manifest ${manifest} ${date} -C ${classes} .
    DEPENDS ${stamp} ${manifest}
    COMMENT "Packing Java ${name}"
    VERBATIM)
  add_custom_target(${name}Jar ALL DEPENDS ${jar})
endfunction()
