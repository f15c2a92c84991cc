"""Reports the results of the benchmarks, and makes the table and the plots of bench/compare."""
