#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/ValueFit.h>
#include <transform/findings/Findings.h>
#include <transform/text/MFBuffer.h>
#include <transform/workspace/IXMLComponentReader.h>
#include <transform/workspace/ParameterLines.h>
#include <transform/workspace/WorkspaceRecords.h>
#include <translation/GlobalParameters.h>
#include <translation/validation/FitChecks.h>

using orx::Rule;

namespace {

void report(const std::vector<ValueFit>& misfits, const TransformParamCfg& parameter, int line,
            const QString& node, orx::Findings& findings) {
  for (const ValueFit& fit : misfits) {
    QString prompt = fit.prompt.isEmpty() ? parameter.getDescription() : fit.prompt;
    if (prompt.isEmpty())
      prompt = parameter.getName();
    findings.reportParameter(fit.isNumber() ? Rule::UnfitNumber : Rule::UnfitChoice, fit.message(), line,
                             node, parameter.getName(), prompt + QLatin1String(": ") + fit.text());
  }
}

}  // namespace

void fit_checks::checkTransformer(const TransformerCfg& cfg, const ParameterLines& lines,
                                  const QString& title, orx::Findings& findings, References references) {
  const auto expand = [&cfg](QString& text) {
    text = MFBuffer::withOrdinaryMacros(text);
    if (cfg.listener())
      cfg.listener()->expandMacros(cfg, text);
  };
  for (const QString& name : cfg.getParameters()) {
    const TransformParamCfg* parameter = cfg.getParameterByMacroName(name);
    const std::vector<ValueFit> misfits = ValueFit::misfitsOf(
        *parameter, parameter->getValue(), references == References::Known ? expand : ValueFit::Expand());
    QString refusal;
    if (!misfits.empty() && cfg.validateParameter(name, refusal))
      report(misfits, *parameter, lines.of(name), title, findings);
  }
}

void fit_checks::checkParameters(const IXMLComponentReader& reader, const GlobalParameters& parameters,
                                 orx::Findings& findings) {
  QStringList documents = QStringList(QString()) + reader.GetSubDocList();
  documents.removeDuplicates();
  for (const QString& document : qAsConst(documents)) {
    for (const GlobalParameterStruct& record : reader.GetGlobalParameterList(document)) {
      const TransformParamCfg parameter(GUIType::fromGuiLine(record.guiLine));
      // A value that the header sets stands against the document's.
      const GlobalParameters::Parameter* known =
          document.isEmpty() ? parameters.find(parameter.getName()) : nullptr;
      const bool isSetElsewhere = known && (known->setInHeader || known->isOverridden);
      report(ValueFit::misfitsOf(parameter, isSetElsewhere ? known->currentValue() : record.defaultValue),
             parameter, isSetElsewhere ? known->line : record.line, document, findings);
    }
  }
}
