// Makes objects of the specialised classes for tests, and keeps what they write.
#pragma once

#include <tests/support/QtPrinters.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerDefinition.h>
#include <transform/core/WorkspaceParameterDirectory.h>

#include <QString>
#include <QStringList>

#include <memory>
#include <vector>

struct SpecialisedParameter {
  const char* name;
  const char* type;
  const char* prompt = "Prompt";
};

// From the factory, with INPUT, OUTPUT and these parameters; the template lists all values, one token a line.
std::unique_ptr<TransformerCfg> makeSpecialised(const char* name, int version,
                                                const std::vector<SpecialisedParameter>& parameters);
// As the registry hands it out, by the shipped definitions in English.
std::unique_ptr<TransformerCfg> makeShipped(const char* name, int version = -1);

// The statements of one instance, continuation lines joined and blanks folded.
QStringList statementsOf(TransformerCfg& cfg);
bool isWritten(TransformerCfg& cfg);
// The text that takes the place of the parameter's token.
QString writtenValue(const TransformerCfg& cfg, const char* parameter);
// Empty when the parameter is accepted, "?" when it is refused without a message.
QString refusalOf(const TransformerCfg& cfg, const char* parameter);

// Knows the published parameters P and Q, the private parameter R and the built-in WORKSPACE_NAME.
struct SmallDirectory : WorkspaceParameterDirectory {
  bool isPublishedParameter(const QString& reference) const override {
    return reference == "$(P)" || reference == "$(Q)";
  }
  bool isPrivateParameter(const QString& reference) const override { return reference == "$(R)"; }
  bool isBuiltInParameter(const QString& reference) const override {
    return reference == "$(WORKSPACE_NAME)";
  }
};
