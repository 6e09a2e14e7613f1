# Finds the platform's logging library: the class HmiLoggingCategory, hmitrace() and hmiperformance().
#
# HmiLogging_ROOT points the search at its folder. Defines the target HmiLogging::HmiLogging.

find_path(HmiLogging_INCLUDE_DIR hmiloggingcategory.h PATH_SUFFIXES HmiLogging)
find_library(HmiLogging_LIBRARY NAMES HmiLogging)
mark_as_advanced(HmiLogging_INCLUDE_DIR HmiLogging_LIBRARY)

include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(HmiLogging
    REQUIRED_VARS HmiLogging_LIBRARY HmiLogging_INCLUDE_DIR)

if(HmiLogging_FOUND AND NOT TARGET HmiLogging::HmiLogging)
    add_library(HmiLogging::HmiLogging UNKNOWN IMPORTED)
    set_target_properties(HmiLogging::HmiLogging PROPERTIES
        IMPORTED_LOCATION ${HmiLogging_LIBRARY}
        INTERFACE_INCLUDE_DIRECTORIES ${HmiLogging_INCLUDE_DIR})
endif()
