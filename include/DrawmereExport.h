/// Marks what the shared library shows to its callers; everything else stays hidden.
#pragma once

#define DRAWMERE_API __attribute__((visibility("default")))
