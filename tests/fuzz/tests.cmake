# The packet fuzzer, built only when asked for (-DMARIGOLD_FUZZ=ON) with clang:
#   cmake -S . -B build-fuzz -G Ninja -DCMAKE_CXX_COMPILER=clang++ -DCMAKE_C_COMPILER=clang -DMARIGOLD_FUZZ=ON
#   cmake --build build-fuzz --target fuzz_cmddata
# It compiles the packet code itself with the sanitizers, so the rest of the
# build may stay as it is.
if(NOT MARIGOLD_FUZZ)
    return()
endif()
if(NOT CMAKE_CXX_COMPILER_ID MATCHES "Clang")
    message(WARNING "MARIGOLD_FUZZ needs clang (CMAKE_CXX_COMPILER=clang++); the fuzz targets are skipped")
    return()
endif()

add_executable(fuzz_cmddata
    "${CMAKE_CURRENT_LIST_DIR}/fuzz_cmddata.cpp"
    "${CMAKE_SOURCE_DIR}/GUIApplication/Communication/CmdData.cpp")
target_include_directories(fuzz_cmddata PRIVATE "${CMAKE_SOURCE_DIR}/GUIApplication")
target_link_libraries(fuzz_cmddata PRIVATE Qt5::Core Qt5::Gui)
set_target_properties(fuzz_cmddata PROPERTIES
    RUNTIME_OUTPUT_DIRECTORY "${CMAKE_BINARY_DIR}/fuzz"
    AUTOMOC OFF AUTOUIC OFF AUTORCC OFF)
target_compile_options(fuzz_cmddata PRIVATE
    -fsanitize=fuzzer,address,undefined -fno-sanitize-recover=undefined -fno-omit-frame-pointer -g)
target_link_options(fuzz_cmddata PRIVATE -fsanitize=fuzzer,address,undefined)
