# The link benchmark talks to the scripted peer of the tests.
target_sources(bench_link PRIVATE
    "${CMAKE_SOURCE_DIR}/tests/support/ScriptedPeer.cpp"
    "${CMAKE_SOURCE_DIR}/tests/support/ScriptedPeer.h")
target_include_directories(bench_link PRIVATE "${CMAKE_SOURCE_DIR}/tests")
target_link_libraries(bench_link PRIVATE Qt5::Test)
