# The weight-table test recomputes the tables with the generator's code and
# reads the CIE data and the ASTM check vectors beside it.
target_link_libraries(tst_weighttables PRIVATE weightgen)
target_compile_definitions(tst_weighttables PRIVATE
    WEIGHTTABLES_DATA_DIR="${CMAKE_SOURCE_DIR}/tools/weighttables/data"
    MARIGOLD_SOURCE_DIR="${CMAKE_SOURCE_DIR}")

# Colour differences are checked against littleCMS.
find_package(PkgConfig REQUIRED)
pkg_check_modules(LCMS2_TEST REQUIRED IMPORTED_TARGET lcms2)
target_link_libraries(tst_colordifference PRIVATE PkgConfig::LCMS2_TEST)
