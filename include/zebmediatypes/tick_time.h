// TickTime and FrameRate.
#pragma once

#include <zebmediatypes/export.h>
