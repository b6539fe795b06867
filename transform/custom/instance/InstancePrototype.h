// What every instance of a custom transformer starts from: name and version, the published parameters with
// their defaults, and the parameters that the system adds to instances.
#pragma once

#include <QLatin1String>

#include <memory>

class CompoundTransformerNetwork;
class TransformerCfg;

// Added to instances of a custom transformer that loops while others wait.
inline const QLatin1String kMaxLoopIterationsParameter("MAX_LOOP_ITERATIONS");
inline const QLatin1String kIterationCountParameter("ITERATION_COUNT_ATTR");
// Added to instances of a custom transformer that may run in several processes, unless its group-by is a
// reference to a parameter.
inline const QLatin1String kProcessGroupByParameter("ORX_PROCESS_GROUP_BY");

std::shared_ptr<const TransformerCfg> makeInstancePrototype(const CompoundTransformerNetwork& network);

// Name, version and what else the network tells without its body.
void configureWithoutBody(TransformerCfg& cfg, const CompoundTransformerNetwork& network);
