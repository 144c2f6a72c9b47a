kelqln_add_benchmark(bench_selection
  SOURCES ${CMAKE_CURRENT_LIST_DIR}/selection_benchmark.cc
  LIBS kelqln_core host_modeltool)
