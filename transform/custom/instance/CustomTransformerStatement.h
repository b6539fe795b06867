// The statement that stands for a custom transformer's body in the mapping file.
#pragma once

#include <transform/custom/ParallelSettings.h>

class CompoundTransformerNetwork;
class MFBuffer;
class TransformerCfg;

// The settings of `network` with the values of the instance's parameters in place of references to them.
ParallelSettings parallelSettingsOf(const CompoundTransformerNetwork& network,
                                    const TransformerCfg& instance);

// Whether the inside runs apart, in a loop or in processes of its own, and gets the parameters as a list.
bool isRunApart(const CompoundTransformerNetwork& network, const TransformerCfg& instance);

// Writes a transform factory, a loop factory or an include line for `instance`. The settings of `network` may
// refer to parameters of the instance.
void writeCustomTransformerStatement(MFBuffer& buffer, const CompoundTransformerNetwork& network,
                                     const TransformerCfg& instance, bool inlineFlag);
