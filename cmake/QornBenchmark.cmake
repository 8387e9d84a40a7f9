# qorn_add_benchmark(<name> SOURCES ... LIBRARIES ... [PEERS ...])
#
# A benchmark program, in <build>/benchmarks. PEERS names other libraries that do the same work and
# are measured in the same run: those of the table below. A peer that the system lacks is left out
# with a message; where it is there, the sources see QORN_HAVE_<PEER> (QORN_HAVE_QT and so on).

include_guard(GLOBAL)
find_package(benchmark REQUIRED)
find_package(PkgConfig QUIET)

# Makes qorn_peer_<name>, which brings headers, libraries and the definition, or nothing at all.
function(qorn_find_peer name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "PACKAGE;PKG_CONFIG" "COMPONENTS;TARGETS")
  set(found FALSE)
  if(arg_PACKAGE)
    find_package(${arg_PACKAGE} QUIET COMPONENTS ${arg_COMPONENTS})
    set(found ${${arg_PACKAGE}_FOUND})
    set(libraries ${arg_TARGETS})
  elseif(PKG_CONFIG_FOUND)
    pkg_check_modules(QORN_PEER_${name} QUIET IMPORTED_TARGET ${arg_PKG_CONFIG})
    set(found ${QORN_PEER_${name}_FOUND})
    set(libraries PkgConfig::QORN_PEER_${name})
  endif()
  add_library(qorn_peer_${name} INTERFACE)
  if(found)
    string(TOUPPER ${name} upper)
    target_compile_definitions(qorn_peer_${name} INTERFACE QORN_HAVE_${upper})
    target_link_libraries(qorn_peer_${name} INTERFACE ${libraries})
  else()
    message(STATUS "Benchmarks: ${name} is not installed, left out")
  endif()
endfunction()

qorn_find_peer(Absl PACKAGE absl TARGETS absl::strings absl::str_format absl::time)
qorn_find_peer(Date PACKAGE date TARGETS date::date date::date-tz)
qorn_find_peer(Fmt PKG_CONFIG fmt)
qorn_find_peer(GLib PKG_CONFIG glib-2.0)
qorn_find_peer(ICU PACKAGE ICU COMPONENTS uc i18n data TARGETS ICU::uc ICU::i18n ICU::data)
qorn_find_peer(OpenSSL PKG_CONFIG libcrypto)
qorn_find_peer(Poco PACKAGE Poco COMPONENTS Foundation TARGETS Poco::Foundation)
qorn_find_peer(Qt PACKAGE Qt5Core TARGETS Qt5::Core)
qorn_find_peer(Spdlog PKG_CONFIG spdlog)
qorn_find_peer(SQLite PKG_CONFIG sqlite3)

function(qorn_add_benchmark name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "SOURCES;LIBRARIES;PEERS")
  add_executable(${name} ${arg_SOURCES})
  set_target_properties(${name} PROPERTIES
    RUNTIME_OUTPUT_DIRECTORY ${PROJECT_BINARY_DIR}/benchmarks)
  list(TRANSFORM arg_PEERS PREPEND qorn_peer_ OUTPUT_VARIABLE peers)
  foreach(peer IN LISTS peers)
    if(NOT TARGET ${peer})
      message(FATAL_ERROR "${name}: ${peer} is not in the table of peers")
    endif()
  endforeach()
  target_link_libraries(${name} PRIVATE
    ${arg_LIBRARIES} ${peers} qorn_benchmark_support qorn_build_options)
endfunction()
