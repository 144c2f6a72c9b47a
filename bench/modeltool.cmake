kelqln_add_benchmark(bench_modeltool
  SOURCES ${CMAKE_CURRENT_LIST_DIR}/modeltool_benchmark.cc
  LIBS host_modeltool)
