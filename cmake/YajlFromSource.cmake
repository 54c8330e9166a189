# Builds yajl from its unpacked source tree (YAJL_SOURCE_DIR) as the static
# target Yajl::yajl, for targets with no system yajl to link: the
# WebAssembly build, where Debian's source package of the machine's own
# yajl version is compiled with the same compiler as the library.
if(NOT EXISTS ${YAJL_SOURCE_DIR}/src/yajl_tree.c)
  message(FATAL_ERROR "YAJL_SOURCE_DIR (${YAJL_SOURCE_DIR}) holds no yajl source tree")
endif()
file(STRINGS ${YAJL_SOURCE_DIR}/CMakeLists.txt yajl_version_lines REGEX "^SET \\(YAJL_(MAJOR|MINOR|MICRO) ")
foreach(line IN LISTS yajl_version_lines)
  string(REGEX REPLACE "^SET \\((YAJL_[A-Z]+) ([0-9]+)\\).*" "\\1;\\2" pair "${line}")
  list(GET pair 0 name)
  list(GET pair 1 value)
  set(${name} ${value})
endforeach()
set(yajl_include ${CMAKE_BINARY_DIR}/yajl-include)
configure_file(${YAJL_SOURCE_DIR}/src/api/yajl_version.h.cmake ${yajl_include}/yajl/yajl_version.h)
foreach(header yajl_common.h yajl_gen.h yajl_parse.h yajl_tree.h)
  configure_file(${YAJL_SOURCE_DIR}/src/api/${header} ${yajl_include}/yajl/${header} COPYONLY)
endforeach()
add_library(yajl_from_source STATIC
  ${YAJL_SOURCE_DIR}/src/yajl.c ${YAJL_SOURCE_DIR}/src/yajl_lex.c ${YAJL_SOURCE_DIR}/src/yajl_parser.c
  ${YAJL_SOURCE_DIR}/src/yajl_buf.c ${YAJL_SOURCE_DIR}/src/yajl_encode.c ${YAJL_SOURCE_DIR}/src/yajl_gen.c
  ${YAJL_SOURCE_DIR}/src/yajl_alloc.c ${YAJL_SOURCE_DIR}/src/yajl_tree.c ${YAJL_SOURCE_DIR}/src/yajl_version.c)
target_compile_definitions(yajl_from_source PRIVATE YAJL_BUILD)
target_include_directories(yajl_from_source PUBLIC $<BUILD_INTERFACE:${yajl_include}>)
add_library(Yajl::yajl ALIAS yajl_from_source)
