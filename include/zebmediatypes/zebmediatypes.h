// zebmediatypes: media value types. Including this header alone gives the
// whole public API.
#pragma once

#include <zebmediatypes/export.h>
#include <zebmediatypes/localized_description.h>

// Time: ticks and frame rates, ratio times, displays and timecode, ranges.
#include <zebmediatypes/ratio_time.h>
#include <zebmediatypes/tick_time.h>
#include <zebmediatypes/time_display.h>
#include <zebmediatypes/time_range.h>

// Timecode text.
#include <zebmediatypes/timecode.h>

// Audio: channel labels, layouts, analysis, conversion matrix.
#include <zebmediatypes/audio_channel_layout.h>
#include <zebmediatypes/channel_conversion_matrix.h>

// Audio: formats, channel maps, buses, native rates, descriptions.
#include <zebmediatypes/audio_bus.h>
#include <zebmediatypes/audio_descriptions.h>
#include <zebmediatypes/audio_format.h>
#include <zebmediatypes/audio_frame_rate_utils.h>
#include <zebmediatypes/channel_map.h>

// Video formats: pixel formats, selection and sizing, aspect ratios,
// descriptions.
#include <zebmediatypes/pixel_aspect_ratio.h>
#include <zebmediatypes/pixel_format.h>
#include <zebmediatypes/pixel_format_selection.h>
#include <zebmediatypes/render_quality.h>
#include <zebmediatypes/video_descriptions.h>

// Colour records and caches, RGBA, MIME constants, library lifecycle.
#include <zebmediatypes/color/color_management_settings.h>
#include <zebmediatypes/color/color_profile.h>
#include <zebmediatypes/color/color_serialization.h>
#include <zebmediatypes/color/color_space.h>
#include <zebmediatypes/color/rgba.h>
#include <zebmediatypes/initialization.h>
#include <zebmediatypes/mime_types.h>
#include <zebmediatypes/scripting/audio_constants.h>
#include <zebmediatypes/scripting/audio_objects.h>
#include <zebmediatypes/scripting/pixel_format_constants.h>
#include <zebmediatypes/scripting/time_objects.h>
#include <zebmediatypes/scripting/video_objects.h>
