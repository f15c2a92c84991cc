"""What the benchmarks use to report their figures, and what bench/compare makes of the reports."""
