// Judges values by what their types offer: choices by their entries, numbers by their kind and range.
#pragma once

#include <QString>

class GlobalParameters;
class IXMLComponentReader;
class ParameterLines;
class TransformerCfg;

namespace orx {
class Findings;
}

namespace fit_checks {

// All parameters of a transformer; what its own validation refuses is left to that.
// References lead to values that are known, or to different ones in each instance of what stands around.
enum class References { Known, Open };
void checkTransformer(const TransformerCfg& cfg, const ParameterLines& lines, const QString& title,
                      orx::Findings& findings, References references);
// What the values of an instance of a custom transformer make of the values inside that refer to them;
// nothing for another transformer. All is told of the instance.
void checkInside(const TransformerCfg& cfg, int line, const QString& title, orx::Findings& findings);
// The global parameters of the workspace and those of its custom transformers, by their prompt lines.
void checkParameters(const IXMLComponentReader& reader, const GlobalParameters& parameters,
                     orx::Findings& findings);

}  // namespace fit_checks
