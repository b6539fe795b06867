// How attributes pass the ports of a custom transformer. (The spelling is the one that documents have.)
#pragma once

// What an editor shows inside a custom transformer of the attributes that reach it. Features keep all of
// theirs in either mode, and so do the answers of a network.
enum IncomingAttributePropogationMode : int {
  kIncomingDeclared = 0,  // those that the input ports declare
  kIncomingAll = 1,       // all that arrive
};

enum OutgoingAttributePropogationMode : int {
  kOutgoingArriving = 0,  // what arrives passes on
  kOutgoingOwnList = 1,   // the output's own list, whatever arrives
};
