# Script objects: the value types as script classes of the scripting host.
target_sources(zebmediatypes PRIVATE
  scripting/time_objects.cpp
)

# The audio, video and colour classes and the tables of their constants.
target_sources(zebmediatypes PRIVATE
  scripting/audio_constants.cpp
  scripting/audio_objects.cpp
  scripting/pixel_format_constants.cpp
  scripting/video_objects.cpp
)
