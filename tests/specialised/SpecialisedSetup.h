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
// With settings "NAME=VALUE | NAME=VALUE", in the form that storedForm() takes, and the attributes a, b, id
// and name at its first input. `last` receives the name of the last setting.
std::unique_ptr<TransformerCfg> makeShippedWith(const char* name, const char* settings,
                                                QString* last = nullptr);
// Answers the name of the last setting.
QString applySettings(TransformerCfg& cfg, const char* settings);
// A decoded value as the parameter stores it; of a table the cells stand between ";". What begins with "`" is
// taken as it stands.
QString storedForm(const TransformerCfg& cfg, const QString& parameter, const QString& text);

// The statements of one instance, continuation lines joined and blanks folded.
QStringList statementsOf(TransformerCfg& cfg);
bool isWritten(TransformerCfg& cfg);
// The text that takes the place of the parameter's token.
QString writtenValue(const TransformerCfg& cfg, const QString& parameter);
// Empty when the parameter is accepted, "?" when it is refused without a message.
QString refusalOf(const TransformerCfg& cfg, const QString& parameter);

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
