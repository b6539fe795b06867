find_package(Qt5 5.15 REQUIRED COMPONENTS Xml)
orx_bench(bench_workspace orx_workspace Qt5::Xml XercesC::XercesC)
