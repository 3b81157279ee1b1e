# Video formats: pixel formats, selection and sizing, aspect ratios, descriptions.
target_sources(zebmediatypes PRIVATE
  pixel_format.cpp
  pixel_format_selection.cpp
  pixel_aspect_ratio.cpp
  video_descriptions.cpp
)
