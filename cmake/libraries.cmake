# The libraries the house stands on; packages.txt names the packages they come from.
find_package(Qt6 6.4 REQUIRED COMPONENTS Core Gui Widgets PrintSupport Svg Test)
find_package(SQLiteCpp REQUIRED)
find_package(PkgConfig REQUIRED)
pkg_check_modules(pqxx REQUIRED IMPORTED_TARGET libpqxx)
pkg_check_modules(pq REQUIRED IMPORTED_TARGET libpq)
pkg_check_modules(sqlite3 REQUIRED IMPORTED_TARGET sqlite3)
pkg_check_modules(sodium REQUIRED IMPORTED_TARGET libsodium)

find_path(ZINT_INCLUDE_DIR zint.h REQUIRED)
find_library(ZINT_LIBRARY zint REQUIRED)
add_library(zint INTERFACE)
target_include_directories(zint SYSTEM INTERFACE ${ZINT_INCLUDE_DIR})
target_link_libraries(zint INTERFACE ${ZINT_LIBRARY})
