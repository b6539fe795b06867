#include <transform/core/CarriedReferences.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/ValueFit.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/findings/Findings.h>
#include <transform/text/MacroText.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/IXMLComponentReader.h>
#include <transform/workspace/ParameterLines.h>
#include <transform/workspace/WorkspaceRecords.h>
#include <translation/GlobalParameters.h>
#include <translation/validation/FitChecks.h>

using carried_references::knownAround;
using orx::Rule;

namespace {

void report(const std::vector<ValueFit>& misfits, const TransformParamCfg& parameter, int line,
            const QString& node, orx::Findings& findings) {
  for (const ValueFit& fit : misfits) {
    QString prompt = fit.prompt.isEmpty() ? parameter.getDescription() : fit.prompt;
    if (prompt.isEmpty())
      prompt = parameter.getName();
    findings.reportParameter(fit.rule(), fit.message(), line, node, parameter.getName(),
                             prompt + QLatin1String(": ") + fit.text());
  }
}

}  // namespace

void fit_checks::checkTransformer(const TransformerCfg& cfg, const ParameterLines& lines,
                                  const QString& title, orx::Findings& findings, References references) {
  for (const QString& name : cfg.getParameters()) {
    // It follows the level of parallel processing, which is judged itself.
    if (name == kProcessCountDisplayParameter)
      continue;
    const TransformParamCfg* parameter = cfg.getParameterByMacroName(name);
    const bool isExpanded = references == References::Known;
    const std::vector<ValueFit> misfits = ValueFit::misfitsOf(
        *parameter, parameter->getValue(), isExpanded ? knownAround(cfg).expand : ExpandReferences());
    QString refusal;
    if (!misfits.empty() && cfg.validateParameter(name, refusal))
      report(misfits, *parameter, lines.of(name), title, findings);
  }
}

void fit_checks::checkInside(const TransformerCfg& cfg, int line, const QString& title,
                             orx::Findings& findings) {
  CompoundTransformerNetwork* network = networkOf(&cfg);
  if (!network)
    return;
  const TransformerCfg* before = network->attributeOwner();
  network->setAttributeOwner(&cfg);
  for (const TransformerCfg* inner : network->getTransformers()) {
    const ExpandReferences expand = knownAround(*inner).expand;
    for (const QString& name : inner->getParameters()) {
      const TransformParamCfg* parameter = inner->getParameterByMacroName(name);
      if (name == kProcessCountDisplayParameter || !beginsMacroReference(parameter->getValue()))
        continue;
      const QString path = title + QLatin1Char('/') + inner->getIdentifier();
      report(ValueFit::misfitsOf(*parameter, parameter->getValue(), expand), *parameter, line, path,
             findings);
      // Nothing looks the settings of several processes up when the mapping file runs.
      const bool isSetting = name == kProcessCountParameter || name == kGroupsOrderedParameter;
      if (isSetting && single_choices::refersToShownSide(*parameter, parameter->getValue(), expand))
        findings.reportUnwritable(line, path, name, TransformResString(orx::messages::kShownSideReferred));
    }
  }
  network->setAttributeOwner(before);
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
