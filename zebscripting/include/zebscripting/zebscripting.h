// zebscripting: the script-object host. Umbrella header.
#pragma once

#include <zebscripting/definition.h>
#include <zebscripting/factory.h>
#include <zebscripting/javascript.h>
#include <zebscripting/script_context.h>
#include <zebscripting/script_object.h>
#include <zebscripting/script_value.h>
#include <zebscripting/types.h>
#include <zebscripting/utils.h>
