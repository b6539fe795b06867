orx_bench(bench_registry orxtransform Qt5::Core)
add_dependencies(bench_registry orxt)
