# Colour records, serialization and caches, RGBA, MIME constants, library lifecycle.
