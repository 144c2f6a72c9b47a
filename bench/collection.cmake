kelqln_add_benchmark(bench_collection
  SOURCES ${CMAKE_CURRENT_LIST_DIR}/collection_benchmark.cc
  LIBS kelqln_automation)
