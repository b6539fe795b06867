// How far a parameter value is unpacked when it is read.
#pragma once

enum class UnpackLevel {
  Stored = 0,    // as it is stored
  Resolved = 1,  // references to workspace parameters resolved, encoding kept
  Decoded = 2,   // also decoded from the word encoding
};
