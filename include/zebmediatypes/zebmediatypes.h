// zebmediatypes: media value types. Including this header alone gives the
// whole public API.
#pragma once

#include <zebmediatypes/export.h>

// Time: ticks and frame rates, ratio times, displays and timecode, ranges.
#include <zebmediatypes/ratio_time.h>
#include <zebmediatypes/tick_time.h>
#include <zebmediatypes/time_display.h>
#include <zebmediatypes/time_range.h>

// Timecode text.

// Audio: channel labels, layouts, analysis, conversion matrix.

// Audio: formats, channel maps, buses, native rates, descriptions.

// Video formats: pixel formats, selection and sizing, aspect ratios,
// descriptions.

// Colour records and caches, RGBA, MIME constants, library lifecycle.
#include <zebmediatypes/color/color_management_settings.h>
#include <zebmediatypes/color/color_profile.h>
#include <zebmediatypes/color/color_serialization.h>
#include <zebmediatypes/color/color_space.h>
#include <zebmediatypes/color/rgba.h>
#include <zebmediatypes/initialization.h>
#include <zebmediatypes/mime_types.h>
