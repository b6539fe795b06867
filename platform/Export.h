// Marks what a library shows to its users; everything else stays hidden.
#pragma once

#define ORX_EXPORT __attribute__((visibility("default")))
