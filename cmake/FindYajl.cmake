# Finds yajl 2 and provides the imported target Yajl::yajl.
find_path(YAJL_INCLUDE_DIR yajl/yajl_tree.h)
find_library(YAJL_LIBRARY NAMES yajl)
include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(Yajl REQUIRED_VARS YAJL_LIBRARY YAJL_INCLUDE_DIR)
if(Yajl_FOUND AND NOT TARGET Yajl::yajl)
  add_library(Yajl::yajl UNKNOWN IMPORTED)
  set_target_properties(Yajl::yajl PROPERTIES
    IMPORTED_LOCATION ${YAJL_LIBRARY}
    INTERFACE_INCLUDE_DIRECTORIES ${YAJL_INCLUDE_DIR})
endif()
mark_as_advanced(YAJL_INCLUDE_DIR YAJL_LIBRARY)
