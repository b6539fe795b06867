// How a value is encoded on its way into the mapping file.
#pragma once

enum class ValueEncoding {
  Plain,       // the text itself
  Word,        // one token of the word encoding
  UserString,  // backslash escapes for control characters, as a text that the user typed
  Quoted,      // quoted for the mapping file where it needs quotes
};
