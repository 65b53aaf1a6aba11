target_compile_definitions(tst_translations PRIVATE
    MARIGOLD_LANGUAGE_DIR="${CMAKE_SOURCE_DIR}/GUIApplication/Language")
