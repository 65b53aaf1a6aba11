# The keypad's input tables are generated at build time from Debian's
# uim-data and m17n-db (see README.md beside this file) and compiled into
# the resources as :/Language/<name>.scm. Included by GUIApplication's
# CMakeLists before the resource list is built; appends to LANGUAGE_FILES.
find_package(Python3 REQUIRED COMPONENTS Interpreter)

set(UIM_PY_SCM "/usr/share/uim/py.scm" CACHE FILEPATH "uim-data's pinyin table")
set(UIM_ZHUYIN_MIM "/usr/share/m17n/zh-zhuyin.mim" CACHE FILEPATH "m17n-db's zhuyin input method")
set(UIM_ROMAJA_MIM "/usr/share/m17n/ko-romaja.mim" CACHE FILEPATH "m17n-db's romaja input method")
foreach(_src IN ITEMS "${UIM_PY_SCM}" "${UIM_ZHUYIN_MIM}" "${UIM_ROMAJA_MIM}")
    if(NOT EXISTS "${_src}")
        message(FATAL_ERROR "${_src} is missing: install uim-data and m17n-db (scripts/deps.sh)")
    endif()
endforeach()

set(_uim_out "${CMAKE_BINARY_DIR}/uimtables")
set(_uim_tables
    "${_uim_out}/romaja.scm"
    "${_uim_out}/simplified_chinese.scm"
    "${_uim_out}/traditional_chinese.scm")
add_custom_command(OUTPUT ${_uim_tables}
    COMMAND Python3::Interpreter "${CMAKE_SOURCE_DIR}/tools/uimtables/uimtables.py"
            --py "${UIM_PY_SCM}" --zhuyin "${UIM_ZHUYIN_MIM}" --romaja "${UIM_ROMAJA_MIM}"
            "${_uim_out}"
    DEPENDS "${CMAKE_SOURCE_DIR}/tools/uimtables/uimtables.py"
            "${UIM_PY_SCM}" "${UIM_ZHUYIN_MIM}" "${UIM_ROMAJA_MIM}"
    COMMENT "Generating the input tables"
    VERBATIM)

set(_uim_qrc "${_uim_out}/uimtables.qrc")
file(CONFIGURE OUTPUT "${_uim_qrc}" CONTENT "<!DOCTYPE RCC><RCC version=\"1.0\">
    <qresource prefix=\"/\">
        <file alias=\"Language/romaja.scm\">${_uim_out}/romaja.scm</file>
        <file alias=\"Language/simplified_chinese.scm\">${_uim_out}/simplified_chinese.scm</file>
        <file alias=\"Language/traditional_chinese.scm\">${_uim_out}/traditional_chinese.scm</file>
    </qresource>
</RCC>
")
set(_uim_qrc_cpp "${_uim_out}/qrc_uimtables.cpp")
add_custom_command(OUTPUT "${_uim_qrc_cpp}"
    COMMAND Qt5::rcc -no-compress -name uimtables "${_uim_qrc}" -o "${_uim_qrc_cpp}"
    DEPENDS "${_uim_qrc}" ${_uim_tables}
    COMMENT "Compiling the input tables into resources"
    VERBATIM)
set_source_files_properties("${_uim_qrc_cpp}" PROPERTIES SKIP_AUTOMOC ON SKIP_AUTOUIC ON GENERATED ON)
list(APPEND CORE_SOURCES "${_uim_qrc_cpp}")
