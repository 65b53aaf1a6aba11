# The targeting benchmark takes its temporary folder and free ports from the
# test helpers.
target_sources(bench_targeting PRIVATE
    "${CMAKE_SOURCE_DIR}/tests/support/TestSupport.cpp"
    "${CMAKE_SOURCE_DIR}/tests/support/TestSupport.h")
target_include_directories(bench_targeting PRIVATE "${CMAKE_SOURCE_DIR}/tests")
