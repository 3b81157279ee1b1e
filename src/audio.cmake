# Audio.

# Channel labels, layouts, layout analysis, conversion matrix.
target_sources(zebmediatypes PRIVATE
  audio_channel_layout.cpp
  audio_layout_analysis.cpp
  channel_conversion_matrix.cpp
)

# Formats, channel maps, buses, native rates, descriptions.
target_sources(zebmediatypes PRIVATE
  audio_format.cpp
  channel_map.cpp
  audio_bus.cpp
  audio_frame_rate_utils.cpp
  audio_descriptions.cpp
)
