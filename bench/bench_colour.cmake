# littleCMS is the outside reference for the L*a*b* conversion.
find_package(PkgConfig REQUIRED)
pkg_check_modules(LCMS2 REQUIRED IMPORTED_TARGET lcms2)
target_link_libraries(bench_colour PRIVATE PkgConfig::LCMS2)
