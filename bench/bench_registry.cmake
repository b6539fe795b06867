orx_bench(bench_registry orx_registry Qt5::Core)
add_dependencies(bench_registry orxt)
