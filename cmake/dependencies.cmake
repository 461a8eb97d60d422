# Libraries of the system. iniparser ships neither a pkg-config file nor a CMake package.
find_package(SQLite3 REQUIRED)
find_path(INIPARSER_INCLUDE_DIR iniparser/iniparser.h REQUIRED)
find_library(INIPARSER_LIBRARY iniparser REQUIRED)
add_library(iniparser::iniparser UNKNOWN IMPORTED)
set_target_properties(iniparser::iniparser PROPERTIES
  IMPORTED_LOCATION "${INIPARSER_LIBRARY}" INTERFACE_INCLUDE_DIRECTORIES "${INIPARSER_INCLUDE_DIR}")
find_package(PkgConfig REQUIRED)
pkg_check_modules(GLIB REQUIRED IMPORTED_TARGET glib-2.0)
pkg_check_modules(DBUS REQUIRED IMPORTED_TARGET dbus-1)
if(ZEL_PLATFORM STREQUAL host)
  find_package(nlohmann_json REQUIRED)
  find_package(CLI11 REQUIRED)
endif()
