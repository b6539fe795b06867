orx_bench(bench_copy orx_core)
