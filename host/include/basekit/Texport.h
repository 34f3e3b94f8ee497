// Export marker of the application's base library and scripting engine.
#pragma once

#define T_EXPORT __attribute__((visibility("default")))
