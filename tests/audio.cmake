# Audio tests.
