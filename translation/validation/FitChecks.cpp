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

#include <algorithm>
#include <vector>

using carried_references::knownAround;
using orx::Rule;

namespace {

// Instances inside one another can be more than anyone could wait for.
constexpr int kMostInstancesInside = 1000;

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

// What the references in the values lead to from where the transformer stands now.
void checkReferring(const TransformerCfg& cfg, int line, const QString& title, orx::Findings& findings) {
  const ExpandReferences expand = knownAround(cfg).expand;
  for (const QString& name : cfg.getParameters()) {
    const TransformParamCfg* parameter = cfg.getParameterByMacroName(name);
    const QString& value = parameter->getValue();
    if (name == kProcessCountDisplayParameter || !beginsMacroReference(value))
      continue;
    report(ValueFit::misfitsOf(*parameter, value, expand), *parameter, line, title, findings);
    // Nothing looks the settings of several processes up when the mapping file runs.
    const bool isSetting = name == kProcessCountParameter || name == kGroupsOrderedParameter;
    if (isSetting && single_choices::refersToShownSide(*parameter, value, expand))
      findings.reportUnwritable(line, title, name, TransformResString(orx::messages::kShownSideReferred));
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
  // The way from the instance inwards; its networks ask whom they stand in for.
  struct Step {
    CompoundTransformerNetwork* network;
    const TransformerCfg* before;
    QString title;
    std::vector<const TransformerCfg*> left;
  };
  std::vector<Step> way;
  int budget = kMostInstancesInside;
  const auto enter = [&](const TransformerCfg& instance, const QString& name) {
    CompoundTransformerNetwork* network = networkOf(&instance);
    if (!network || --budget < 0)
      return;
    way.push_back({network, network->attributeOwner(), name, {}});
    network->setAttributeOwner(&instance);
    for (const TransformerCfg* inner : network->getTransformers())
      way.back().left.push_back(inner);
    std::reverse(way.back().left.begin(), way.back().left.end());
  };
  enter(cfg, title);
  while (!way.empty()) {
    if (way.back().left.empty()) {
      way.back().network->setAttributeOwner(way.back().before);
      way.pop_back();
      continue;
    }
    const TransformerCfg& inner = *way.back().left.back();
    way.back().left.pop_back();
    const QString path = way.back().title + QLatin1Char('/') + inner.getIdentifier();
    checkReferring(inner, line, path, findings);
    enter(inner, path);
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
