# The language switch reads the translation sources to know which texts
# must change.
target_compile_definitions(tst_languageswitch PRIVATE
    MARIGOLD_LANGUAGE_DIR="${CMAKE_SOURCE_DIR}/GUIApplication/Language")
