target_compile_definitions(tst_assets PRIVATE MARIGOLD_APP_DIR="${CMAKE_SOURCE_DIR}/GUIApplication")
