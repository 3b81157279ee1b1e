# Audio benchmarks.

# Conversion matrix.

# Native rates and descriptions.
