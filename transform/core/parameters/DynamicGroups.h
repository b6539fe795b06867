// Group parameters that follow the values of a parameter.
#pragma once

#include <QString>

class ParameterSet;
class TransformerCfg;

// Makes the groups DYNGROUP_<parameter>_<n> those of the parameter's value, n from 1 in the order of the
// names: adds, replaces and removes. A name that is there twice counts once.
void updateDynamicParameterGroups(const TransformerCfg& cfg, ParameterSet& parameters,
                                  const QString& parameter);
