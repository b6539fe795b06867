// Statements that a class adds behind those of its template.
#pragma once

#include <QString>

class MFBuffer;
class TransformerCfg;

// Writes "FACTORY_OPTION NAME KEY VALUE" for the factory that bears the instance's name. False, and nothing
// is written, when the value cannot stand in a statement.
bool writeFactoryOption(const TransformerCfg& cfg, const QString& key, const QString& value,
                        MFBuffer& buffer);
