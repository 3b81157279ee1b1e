# Colour records, serialization and caches, RGBA, MIME constants, library lifecycle.
target_sources(zebmediatypes PRIVATE
  color/color_records.cpp
  color/color_serialization.cpp
  mime_types.cpp
  initialization.cpp
)
