# The weight-table test recomputes the tables with the generator's code and
# reads the CIE data and the ASTM check vectors beside it.
target_link_libraries(tst_weighttables PRIVATE weightgen)
target_compile_definitions(tst_weighttables PRIVATE
    WEIGHTTABLES_DATA_DIR="${CMAKE_SOURCE_DIR}/tools/weighttables/data"
    MARIGOLD_SOURCE_DIR="${CMAKE_SOURCE_DIR}")
