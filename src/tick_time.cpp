#include <zebmediatypes/tick_time.h>
