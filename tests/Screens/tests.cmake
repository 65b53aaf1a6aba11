# The language switch reads the translation sources to know which texts
# must change.
target_compile_definitions(tst_languageswitch PRIVATE
    MARIGOLD_LANGUAGE_DIR="${CMAKE_SOURCE_DIR}/GUIApplication/Language")

# The screenshot tour takes every screen in every language and fails on
# any text that does not fit its box or has no glyphs in the language's
# font. The long tours cost most, so they start first.
file(GLOB _tours CONFIGURE_DEPENDS "${CMAKE_CURRENT_LIST_DIR}/tst_tour_*.cpp")
set(_tour_tests tst_screenshot_tour)
foreach(_src IN LISTS _tours)
    get_filename_component(_name "${_src}" NAME_WE)
    list(APPEND _tour_tests ${_name})
endforeach()
foreach(_t IN LISTS _tour_tests)
    set_property(TEST ${_t} APPEND PROPERTY ENVIRONMENT "MARIGOLD_TOUR_LANGUAGES=all" "MARIGOLD_TOUR_STRICT=1")
    set_tests_properties(${_t} PROPERTIES LABELS "tour" TIMEOUT 900 COST 500)
endforeach()
