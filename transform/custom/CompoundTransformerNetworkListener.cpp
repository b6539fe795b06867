#include <transform/custom/CompoundTransformerNetworkListener.h>

CompoundTransformerNetworkListener::~CompoundTransformerNetworkListener() = default;
