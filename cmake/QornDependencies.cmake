# The libraries that the foundation stands on. What only tests, benchmarks or fuzz targets use is
# looked for where they are built.

include_guard(GLOBAL)

if(QORN_LIBCXX)
  include(QornLibcxx)
else()
  # Boost's own package file; from release 3.30 on CMake warns where its module is meant.
  if(POLICY CMP0167)
    cmake_policy(SET CMP0167 NEW)
  endif()
  # Archives, so that the product meets no other Boost in the host's process.
  set(Boost_USE_STATIC_LIBS ON)
  find_package(Boost 1.81 REQUIRED COMPONENTS filesystem thread)
endif()
if(NOT APPLE)
  find_package(ICU 72 REQUIRED COMPONENTS uc i18n data)
  find_package(Plist REQUIRED)
endif()

# JAVA_HOME may be unset although there is a compiler; its real place then says where. Homebrew keeps
# its own off the path, where macOS has one that only tells that there is none.
macro(qorn_find_java)
  if(NOT JAVA_HOME AND NOT DEFINED ENV{JAVA_HOME})
    if(APPLE)
      set(QORN_JAVAC_HINTS HINTS /opt/homebrew/opt/openjdk@17/bin /usr/local/opt/openjdk@17/bin)
    endif()
    find_program(QORN_JAVAC javac ${QORN_JAVAC_HINTS})
    mark_as_advanced(QORN_JAVAC)
    if(QORN_JAVAC AND NOT (APPLE AND QORN_JAVAC MATCHES "/usr/bin/javac$"))
      file(REAL_PATH ${QORN_JAVAC} QORN_JAVAC_FILE)
      cmake_path(GET QORN_JAVAC_FILE PARENT_PATH JAVA_HOME)
      cmake_path(GET JAVA_HOME PARENT_PATH JAVA_HOME)
    endif()
  endif()
  find_package(JNI QUIET COMPONENTS JVM)
  find_package(Java 11 QUIET COMPONENTS Development)
  if(NOT JNI_FOUND OR NOT Java_FOUND)
    message(FATAL_ERROR "The Java bridge needs a JDK 11 or newer (Debian: openjdk-17-jdk-headless); "
      "-DQORN_BUILD_BRIDGE=OFF builds the foundation alone")
  endif()
endmacro()

if(QORN_BUILD_BRIDGE)
  qorn_find_java()
endif()
