# Script objects: the value types as script classes of the scripting host.
target_sources(zebmediatypes PRIVATE
  scripting/time_objects.cpp
)
