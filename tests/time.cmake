# Time tests.
