orx_bench(bench_network orx_custom Boost::boost)
