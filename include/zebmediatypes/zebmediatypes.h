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
#include <zebmediatypes/pixel_aspect_ratio.h>
#include <zebmediatypes/pixel_format.h>
#include <zebmediatypes/pixel_format_selection.h>
#include <zebmediatypes/render_quality.h>
#include <zebmediatypes/video_descriptions.h>

// Colour records and caches, RGBA, MIME constants, library lifecycle.
