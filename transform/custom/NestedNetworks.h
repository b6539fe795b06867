// The networks that a custom transformer is made of: its own, and those of the custom transformers that stand
// inside it at any depth.
#pragma once

#include <platform/Export.h>

#include <QString>

#include <vector>

class CompoundTransformerNetwork;
class TransformerCfg;

ORX_EXPORT bool isCustomTransformer(const TransformerCfg* cfg);
// The network of a custom transformer's instance; null for any other transformer, and when the
// network is gone.
ORX_EXPORT CompoundTransformerNetwork* networkOf(const TransformerCfg* cfg);
// The transformer's name for a message about what it has; that of a linked custom transformer with its file.
ORX_EXPORT QString nameWithFile(const TransformerCfg& cfg);

// The roots first, each network once, however often it is placed and also when it stands inside itself.
// Bodies that are not loaded yet are loaded.
ORX_EXPORT std::vector<CompoundTransformerNetwork*> nestedNetworks(CompoundTransformerNetwork& root);
ORX_EXPORT std::vector<CompoundTransformerNetwork*> nestedNetworks(
    const std::vector<CompoundTransformerNetwork*>& roots);

// Why a custom transformer cannot be written under this name. A message for the user; empty when it can.
ORX_EXPORT QString findNameFault(const QString& name);
// Why instances of the network cannot be written: it stands inside itself, or custom transformers stand in
// it deeper than 64 levels. A message for the user; empty when all is well.
ORX_EXPORT QString findNestingFault(CompoundTransformerNetwork& root);
// Why the inside of one cannot be told from that of another inside it: the names of both give the same prefix
// macro. A message for the user; empty when all is well.
ORX_EXPORT QString findPrefixFault(CompoundTransformerNetwork& root);
