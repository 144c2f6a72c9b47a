kelqln_add_benchmark(bench_engine
  SOURCES ${CMAKE_CURRENT_LIST_DIR}/engine_benchmark.cc
  LIBS kelqln_core host_modeltool host_strings host_codeview)
