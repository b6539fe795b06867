// The part of TransformerCfg that interprets a definition.
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/Keywords.h>
#include <transform/core/ParallelLevels.h>
#include <transform/core/StoredValue.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/definition/CompiledTemplate.h>
#include <transform/core/definition/DependencyChecker.h>
#include <transform/files/ProductFiles.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <QSet>
#include <QTextStream>

namespace messages = orx::messages;

namespace {

const QLatin1String kNoStored("No");
const QLatin1String kYesStored("Yes");

// The levels of parallelism: shown, and as they are stored.
const QLatin1String kProcessCountDisplayType(
    "CHOICE \"No Parallelism\"%\"Minimal\"%\"Moderate\"%\"Aggressive\"%\"Extreme\"");
const QLatin1String kProcessCountLookup(
    "\"No Parallelism\",NO_PARALLELISM%\"Minimal\",MINIMAL%\"Moderate\",MODERATE%\"Aggressive\",AGGRESSIVE%"
    "\"Extreme\",EXTREME");
const QLatin1String kProcessCountDefault("No Parallelism");

const QLatin1String kInputMapping("I:");
const QLatin1String kOutputMapping("O:");

void note(QTextStream* log, const TransformerDefinition& fields, const QString& text) {
  if (log) {
    *log << fields.name << QLatin1String(" version ") << fields.version << QLatin1String(": ") << text
         << QLatin1Char('\n');
  }
}

// A token [VERSION:]I:OLD=NEW or [VERSION:]O:OLD=NEW, taken apart.
bool addTagMapping(ConfiguredDefinition& definition, const QString& token) {
  QString version;
  QString mapping = token;
  const int colon = token.indexOf(QLatin1Char(':'));
  bool isNumber = false;
  token.left(colon).toInt(&isNumber);
  if (isNumber) {
    version = token.left(colon + 1);
    mapping = token.mid(colon + 1);
  }
  if (mapping.startsWith(kInputMapping)) {
    return definition.renamedInputTags.add(version + mapping.mid(kInputMapping.size()));
  }
  return mapping.startsWith(kOutputMapping) &&
         definition.renamedOutputTags.add(version + mapping.mid(kOutputMapping.size()));
}

TransformParamCfg makeParameter(const QString& typeText, const QString& name, const QString& prompt,
                                const QString& defaultValue, const QStringList& lookupLines = QStringList()) {
  TransformParamCfg record(GUIType::fromTransformerTypeString(typeText, name, prompt), lookupLines);
  record.setDefaultValue(defaultValue);
  record.setValue(withAttributeReference(record, defaultValue));
  return record;
}

}  // namespace

void TransformerCfg::configure(const TransformerDefinition& definition, IORXSession* session,
                               QTextStream* log) {
  const auto own = std::make_shared<ConfiguredDefinition>();
  own->fields = definition;
  own->categoryTags = ConfiguredDefinition::tagsOf(definition.category);
  parseTagAliases(*own);
  initListActionDictionary(*own, log);
  setupPreservesAttributes(*own, log);
  for (const QString& token : definition.parameterMapping) {
    if (!own->renamedParameters.add(token)) {
      note(log, definition, QLatin1String("PARAMETER_MAPPING: no renaming: ") + token);
    }
  }
  for (const QString& token : definition.tagMapping) {
    // The keyword is read without its colon, which may thus be left over.
    if (token != QLatin1String(":") && !addTagMapping(*own, token)) {
      note(log, definition, QLatin1String("TAG_MAPPING: no renaming: ") + token);
    }
  }
  if (!definition.templateLines.isEmpty()) {
    own->compiledTemplate = std::make_shared<CompiledTemplate>(definition.templateLines);
  }
  checkDependencies(*own, log);

  m_session = session;
  m_definition = own;
  m_preserved.reset();
  m_transformerType = isProductFile(definition.filePath) ? kBuiltIn : kOrdinary;
  addDefinedParameters(own->fields, log);
  addDefaultParms();
}

void TransformerCfg::parseTagAliases(ConfiguredDefinition& definition) {
  definition.inputTags = TagList::parse(definition.fields.inputTags);
  definition.dynamicInputTags = TagList::parse(definition.fields.dynamicInputTags);
  definition.outputTags = TagList::parse(definition.fields.outputTags);
  definition.inputTagAliases = definition.dynamicInputTags.aliases;
  for (const QString& tag : std::as_const(definition.inputTags.tags)) {
    const QString alias = definition.inputTags.aliases.value(tag);
    if (!alias.isEmpty()) {
      definition.inputTagAliases.insert(tag, alias);
    }
  }
}

void TransformerCfg::initListActionDictionary(ConfiguredDefinition& definition, QTextStream* log) {
  for (const QString& line : std::as_const(definition.fields.listActions)) {
    if (!definition.attributeRules.addListAction(line)) {
      note(log, definition.fields, QLatin1String("LIST_ACTION: not understood: ") + line);
    }
  }
}

void TransformerCfg::setupPreservesAttributes(ConfiguredDefinition& definition, QTextStream* log) {
  AttributeRules& rules = definition.attributeRules;
  const QStringList& tags = definition.outputTags.tags;
  const QSet<QString> outputs(tags.begin(), tags.end());
  rules.preserved = PreservedAttributes::parse(definition.fields.preservesAttributes);
  for (const QString& token : std::as_const(definition.fields.preservesAttributes)) {
    const QString output = token.section(QLatin1Char(':'), 0, 0);
    if (token != kAllToken && token != kNoneToken && !token.startsWith(QLatin1Char('=')) &&
        !outputs.contains(output)) {
      note(log, definition.fields, QLatin1String("PRESERVES_ATTRIBUTES: no output: ") + token);
    }
  }
  for (const QString& token : std::as_const(definition.fields.attributesAdded)) {
    rules.addAttribute(token, outputs);
  }
}

void TransformerCfg::addDefinedParameters(const TransformerDefinition& fields, QTextStream* log) {
  m_parameters.clear();
  for (int i = 0; i < fields.parameterNames.size(); ++i) {
    const QString& name = fields.parameterNames[i];
    if (name.isEmpty() || m_parameters.indexOf(name) >= 0) {
      note(log, fields, QLatin1String("PARAMETER_NAME: missing or there twice: ") + name);
      continue;
    }
    QString type = fields.parameterTypes.value(i);
    if (GUIType::fromTransformerTypeString(type).isNull()) {
      note(log, fields, QLatin1String("PARAMETER_TYPE: missing, taken as TEXT: ") + name);
      type = kTextType;
    }
    QString defaultValue = fields.parameterDefaults.value(i);
    if (defaultValue.isEmpty() && name == fields.multiProcess) {
      defaultValue = kUnusedGroupBy;
    }
    const TransformParamCfg record = makeParameter(type, name, fields.parameterPrompts.value(i), defaultValue,
                                                   fields.parameterLookups.value(name));
    if (!record.isKnown()) {
      note(log, fields, QLatin1String("PARAMETER_TYPE: unknown: ") + record.getType());
    }
    m_parameters.append(record);
  }
  if (!fields.multiProcess.isEmpty() && m_parameters.indexOf(fields.multiProcess) < 0) {
    note(log, fields, QLatin1String("MULTIPROCESS: no parameter: ") + fields.multiProcess);
  }
}

void TransformerCfg::addDefaultParms() {
  const QString& language = configured().fields.language;
  const auto add = [this](const TransformParamCfg& record) {
    if (!hasParameter(record.getName())) {
      m_parameters.append(record);
    }
  };
  add(makeParameter(kTextType, kIdentifierParameter,
                    TransformResStringIn(language, messages::kIdentifierPrompt), QString()));
  if (configured().fields.multiProcess.isEmpty()) {
    return;
  }
  add(makeParameter(QLatin1String("CHOICE ") + parallelLevels().join(QLatin1Char('%')),
                    kProcessCountParameter, TransformResStringIn(language, messages::kProcessCountPrompt),
                    kProcessCountDefault, QStringList(kProcessCountLookup)));
  add(makeParameter(kProcessCountDisplayType, kProcessCountDisplayParameter, QString(),
                    kProcessCountDefault));
  const auto entry = [&language](long shown, QLatin1String stored) {
    return ORX_quoteConfigPiece(TransformResStringIn(language, shown)) + QLatin1Char(',') +
           QORXWwjdEncode(stored);
  };
  add(makeParameter(QLatin1String("LOOKUP_CHOICE ") + entry(messages::kNo, kNoStored) + QLatin1Char('%') +
                        entry(messages::kYes, kYesStored),
                    kGroupsOrderedParameter, TransformResStringIn(language, messages::kGroupsOrderedPrompt),
                    kNoStored));
}

void TransformerCfg::checkDependencies(ConfiguredDefinition& definition, QTextStream* log) {
  const DependencyChecker::Verdict verdict = DependencyChecker::check(definition.fields.dependencyScripts);
  definition.dependencyMet = verdict.isMet;
  definition.dependencyMessage = verdict.message;
  if (!verdict.isMet) {
    note(log, definition.fields, QLatin1String("DEPENDENCY: ") + verdict.message.trimmed());
  }
}
