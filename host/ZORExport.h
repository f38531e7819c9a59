// What a library of the solver shows to others; everything else in it stays hidden.
#pragma once

#define ZOR_EXPORT __attribute__((visibility("default")))
