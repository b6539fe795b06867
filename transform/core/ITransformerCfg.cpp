#include <transform/core/ITransformerCfg.h>

ITransformerCfg::~ITransformerCfg() = default;
