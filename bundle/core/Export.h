#pragma once

// What the module shows to others: plain functions, under their own names.
#define AX_EXPORT extern "C" __attribute__((visibility("default")))
