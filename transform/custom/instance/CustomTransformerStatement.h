// The statement that stands for a custom transformer's body in the mapping file.
#pragma once

class CompoundTransformerNetwork;
class MFBuffer;
class TransformerCfg;

// Writes a transform factory, a loop factory or an include line for `instance`. The settings of `network` may
// refer to parameters of the instance.
void writeCustomTransformerStatement(MFBuffer& buffer, const CompoundTransformerNetwork& network,
                                     const TransformerCfg& instance, bool inlineFlag);
