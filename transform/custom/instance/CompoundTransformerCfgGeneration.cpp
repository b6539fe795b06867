// What an instance of a custom transformer writes into the mapping file.
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/CarriedReferences.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/LookupChecks.h>
#include <transform/core/ParallelLevels.h>
#include <transform/core/ParameterReferences.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/StoredValue.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/ValueReferences.h>
#include <transform/core/ValueShape.h>
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/FlowGraph.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/ScriptParameters.h>
#include <transform/custom/instance/CustomTransformerStatement.h>
#include <transform/custom/instance/InstancePrototype.h>
#include <transform/custom/instance/ParameterPlaces.h>
#include <transform/scripts/ScriptBlocks.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MacroText.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextPlaces.h>

#include <algorithm>
#include <optional>

namespace messages = orx::messages;

namespace {

const QLatin1String kSetterAttributeType("STRING_OR_ATTR_ENCODED");

// Takes features of the types and lets them go on as another one; without one they end here.
QStringList teeFactory(const QString& name, const QStringList& inputs, const QString& output,
                       const QStringList& functions = QStringList()) {
  QStringList lines{QString(kTeeFactoryStatement),
                    QLatin1String("  FACTORY_NAME \"") + name + QLatin1Char('"')};
  for (const QString& input : inputs)
    lines.append(QLatin1String("  INPUT FEATURE_TYPE ") + quotifyStringForMF(input));
  if (output.isEmpty())
    return lines;
  lines.append(QLatin1String("  OUTPUT FEATURE_TYPE ") + quotifyStringForMF(output));
  for (const QString& function : functions)
    lines.append(QLatin1String("    ") + function);
  return lines;
}

// References to the instance's parameters, "$(NAME)", become references to its macros.
QString redirectReferences(const QString& value, const QString& prefixMacro, const TransformerCfg& instance) {
  return replaceParameterReferences(value, [&](const QString& name, QString& replacement) {
    replacement = QLatin1String("$($(") + prefixMacro + QLatin1String(")_") + name + QLatin1Char(')');
    return instance.hasParameter(name);
  });
}

// The first parameter of the instance that the value refers to; empty when there is none.
QString ownReference(const QString& value, const TransformerCfg& instance) {
  QString own;
  anyParameterReference(MFBuffer::withOrdinaryMacros(value), [&](const QString& name) {
    own = instance.hasParameter(name) ? name : QString();
    return !own.isEmpty();
  });
  return own;
}

// Those of an instance that mean each other, so that an engine would never have done with them.
QStringList parametersInCircles(const TransformerCfg& instance) {
  const QStringList names = instance.getParameters();
  QHash<QString, int> numbers;
  for (const QString& name : names)
    numbers.insert(name, numbers.size());
  std::vector<std::pair<int, int>> edges;
  std::vector<int> roots;
  for (const QString& name : names) {
    const TransformParamCfg* record = instance.getParameterByMacroName(name);
    if (!record || !record->getFlag(kGUITypeInstanceMacros))
      continue;
    roots.push_back(numbers.value(name));
    anyParameterReference(MFBuffer::withOrdinaryMacros(instance.getParameterValue(name)),
                          [&](const QString& other) {
                            const auto number = numbers.constFind(other);
                            if (number != numbers.constEnd())
                              edges.emplace_back(numbers.value(name), number.value());
                            return false;
                          });
  }
  QStringList found;
  FlowGraph(static_cast<std::size_t>(names.size()), edges).walk(roots, [&](const FlowGraph::Group& group) {
    for (const int* at = group.begin; group.isCycle && at != group.end; ++at)
      found.append(names.at(*at));
  });
  return found;
}

bool isYesOrNo(const QString& value) {
  return value == QLatin1String("Yes") || value == QLatin1String("No");
}

bool isIterationCount(const QString& value) {
  bool isNumber = false;
  return isUnsetValue(value) || value.toInt(&isNumber) > 0 ||
         isParameterReference(MFBuffer::withOrdinaryMacros(value));
}

// "@Value(NAME)" of an encoded name or of a reference.
QString attributeValueForm(const QString& value) {
  if (isUnsetValue(value) || value.startsWith(kValueReference))
    return value;
  const QString word = isValueReference(value) ? valueReferences(value).front().word : value;
  return kValueReference + word + QLatin1Char(')');
}

bool areClosed(const std::vector<QStringList>& statements) {
  return std::all_of(statements.begin(), statements.end(), [](const QStringList& lines) {
    return std::all_of(lines.begin(), lines.end(), &MFBuffer::closesDeferredMacros);
  });
}

void write(MFBuffer& buffer, const std::vector<QStringList>& statements) {
  for (const QStringList& lines : statements) {
    buffer.addLines(lines);
    buffer.flush();
  }
}

}  // namespace

bool CompoundTransformerCfg::doInstantiate(MFBuffer& buffer, bool inlineFlag) {
  if (!instantiationFault().isEmpty())
    return false;
  const QString id = getIdentifier();
  const QString prefix = makePrefixMacro(getVisualName());
  const bool hasParameters = !(m_network->blockedLooping() && inlineFlag);
  Statements before = inputCollectors();
  if (hasParameters) {
    before.push_back({kMacroStatement + prefix + QLatin1Char(' ') + id});
    for (const QString& statement : parameterStatements(prefix, false))
      before.push_back({statement});
  }
  const Statements behind = outputRenamers();
  const ParallelSettings parallel = parallelSettingsOf(*m_network, *this);
  QStringList inputs;
  QStringList outputs;
  getInputTags(inputs);
  getOutputTags(outputs);
  const QStringList body = QStringList{id,
                                       m_network->getName(),
                                       getVisualName(),
                                       getTransformerParams(),
                                       parallel.groupBy,
                                       parallel.parallelism,
                                       parallel.processSetting} +
                           m_network->getLoops() + inputs + outputs;
  if (!areClosed(before) || !areClosed({body}) || !areClosed(behind))
    return false;

  write(buffer, before);
  if (hasParameters)
    m_network->saveSubdocPrefixMacro(prefix, id);
  const bool isWritten = m_network->instantiate(buffer, this, inlineFlag);
  write(buffer, behind);
  return isWritten;
}

CompoundTransformerCfg::Statements CompoundTransformerCfg::inputCollectors() const {
  const QString id = getIdentifier();
  QStringList tags;
  getInputTags(tags);
  Statements statements;
  for (const QString& tag : qAsConst(tags)) {
    const QStringList featureTypes = getInputFeatureTypes(tag);
    if (!featureTypes.isEmpty())
      statements.push_back(teeFactory(id + QLatin1Char(' ') + tag + kInputCollectorName, featureTypes,
                                      id + QLatin1Char('_') + tag));
  }
  return statements;
}

CompoundTransformerCfg::Statements CompoundTransformerCfg::outputRenamers() const {
  const QString id = getIdentifier();
  QStringList tags;
  getOutputTags(tags);
  Statements statements;
  for (const QString& tag : qAsConst(tags)) {
    QString featureType;
    getOutputFeatureType(tag, featureType);
    statements.push_back(teeFactory(id + QLatin1Char(' ') + tag + kOutputRenamerName,
                                    {id + QLatin1Char('_') + tag}, featureType, getOutputTagFuncs(tag)));
  }
  return statements;
}

QStringList CompoundTransformerCfg::getTransformFactoryInputLines() const {
  const QString id = getIdentifier();
  QStringList tags;
  getInputTags(tags);
  QStringList lines;
  for (const QString& tag : qAsConst(tags)) {
    lines.append(QLatin1String("   INPUT ") + tag + QLatin1String(" FEATURE_TYPE ") +
                 quotifyStringForMF(id + QLatin1Char('_') + tag));
  }
  return lines;
}

void CompoundTransformerCfg::writeParametersToMappingFile(MFBuffer& buffer, const QString& prefixMacro,
                                                          bool defaultsOnly) const {
  Statements statements;
  for (const QString& statement : parameterStatements(prefixMacro, defaultsOnly))
    statements.push_back({statement});
  write(buffer, statements);
}

QStringList CompoundTransformerCfg::parameterStatements(const QString& prefixMacro, bool defaultsOnly) const {
  QStringList statements;
  const QLatin1String keyword = defaultsOnly ? kDefaultMacroStatement : kMacroStatement;
  std::optional<QSet<QString>> setterDestinations;  // found when the first parameter asks for them
  for (const QString& parameter : getParameters()) {
    const GUIType& type = getParameterGUIType(parameter);
    const QString stored = getParameterValue(parameter);
    const ScriptLanguage language = scriptLanguage(type);
    if (language != ScriptLanguage::None && !isUnsetValue(stored)) {
      if (language == ScriptLanguage::Python)
        getPythonParameterLines(prefixMacro, parameter, stored, statements);
      else
        getTclParameterLines(prefixMacro, parameter, stored, statements);
      continue;
    }
    QString value;
    if (language == ScriptLanguage::None)
      value = macroValue(parameter, type, prefixMacro);
    if (type.getType() == kSetterAttributeType) {
      if (!setterDestinations)
        setterDestinations = attributeSetterDestinations();
      if (setterDestinations->contains(kMacroOpen + parameter + QLatin1Char(')')))
        value = attributeValueForm(value);
    }
    const QString macro =
        prefixMacro.isEmpty() ? parameter : kMacroOpen + prefixMacro + QLatin1String(")_") + parameter;
    statements.append(keyword + macro + QLatin1Char(' ') + value);
  }
  return statements;
}

QString CompoundTransformerCfg::macroValue(const QString& parameter, const GUIType& type,
                                           const QString& prefixMacro) const {
  const TransformParamCfg* record = getParameterByMacroName(parameter);
  const QString stored = getParameterValue(parameter);
  const QString value = stripBasicStringInfo(getParameterValueForMappingFile(
      record ? single_choices::toStored(*record, stored) : stored, type.valueIsEncoded(), false));
  return record && record->getFlag(kGUITypeInstanceMacros) && !prefixMacro.isEmpty()
             ? redirectReferences(MFBuffer::withOrdinaryMacros(value), prefixMacro, *this)
             : value;
}

QHash<QString, QString> CompoundTransformerCfg::findUnwritableParameters() const {
  const QString prefix = makePrefixMacro(getVisualName());
  const bool isApart = m_network && isRunApart(*m_network, *this);
  std::optional<ParameterPlaces> places;  // found when the first value asks for them
  QHash<QString, QString> messages;
  QSet<QString> before;
  for (const QString& parameter : getParameters()) {
    const GUIType& type = getParameterGUIType(parameter);
    const QString stored = getParameterValue(parameter);
    const ScriptLanguage language = scriptLanguage(type);
    const TransformParamCfg* record = getParameterByMacroName(parameter);
    QString message = record ? value_shape::fault(*record, stored) : QString();
    QStringList lines;
    if (message.isEmpty() && language == ScriptLanguage::None) {
      lines.append(macroValue(parameter, type, prefix));
      if (lines.first().contains(QLatin1Char('\n')) || lines.first().contains(QLatin1Char('\r')))
        message = TransformResString(messages::kLineBreak, parameter);
    } else if (message.isEmpty() && !isUnsetValue(stored)) {
      const bool isPython = language == ScriptLanguage::Python;
      if (isPython ? canWritePythonParameter(prefix, parameter, stored, message)
                   : canWriteTclParameter(prefix, parameter, stored, message))
        message = unsetReadByScript(
            isPython, parameter, stored, [&](const QString& name) { return before.contains(name); },
            [this](const QString& name) { return hasParameter(name); });
      if (isPython)
        getPythonParameterLines(prefix, parameter, stored, lines);
      else
        getTclParameterLines(prefix, parameter, stored, lines);
    }
    if (const long number = message.isEmpty() && isApart ? refuseApart(parameter, type, stored) : 0)
      message = number == messages::kOwnReferenceForWorkers
                    ? TransformResString(number, ownReference(stored, *this))
                    : TransformResString(number);
    if (message.isEmpty() && !areClosed({lines}))
      message = TransformResString(messages::kUnclosedReference, parameter);
    if (message.isEmpty() && language == ScriptLanguage::None) {
      if (const long number = refuseMacroValue(parameter, lines.first(), places))
        message = TransformResString(number);
    }
    if (!message.isEmpty())
      messages.insert(parameter, message);
    before.insert(parameter);
  }
  for (const QString& parameter : parametersInCircles(*this)) {
    if (!messages.contains(parameter))
      messages.insert(parameter, TransformResString(messages::kGrowsWithoutEnd));
  }
  return messages;
}

// What the list of parameters that a loop or a process of its own is given does not carry.
long CompoundTransformerCfg::refuseApart(const QString& parameter, const GUIType& type,
                                         const QString& stored) const {
  if (m_network->blockedLooping() && parameter == kMaxLoopIterationsParameter) {
    if (parallelSettingsOf(*m_network, *this).isEnabled())
      return messages::kLoopInProcesses;
    if (!isIterationCount(getParameterValue(parameter, UnpackLevel::Decoded)))
      return messages::kBadMaximum;
  }
  if (scriptLanguage(type) != ScriptLanguage::None)
    return isUnsetValue(stored) ? 0 : messages::kScriptForWorkers;
  const TransformParamCfg* record = getParameterByMacroName(parameter);
  if (record && record->getFlag(kGUITypeInstanceMacros) && !ownReference(stored, *this).isEmpty())
    return messages::kOwnReferenceForWorkers;
  return 0;
}

// A Tcl script of the instance, or of one inside at any depth, prints the statement that sets its macro; the
// macro's name begins with that of the instance.
bool CompoundTransformerCfg::printsMacroNames() const {
  const auto prints = [](const TransformerCfg& cfg) {
    const QStringList names = cfg.getParameters();
    return std::any_of(names.begin(), names.end(), [&](const QString& name) {
      return scriptLanguage(cfg.getParameterGUIType(name)) == ScriptLanguage::Tcl &&
             !isUnsetValue(cfg.getParameterValue(name));
    });
  };
  if (prints(*this))
    return true;
  for (const CompoundTransformerNetwork* network :
       m_network ? nestedNetworks(*m_network) : std::vector<CompoundTransformerNetwork*>()) {
    const auto& inside = network->getTransformers();
    if (std::any_of(inside.begin(), inside.end(),
                    [&](const TransformerCfg* cfg) { return networkOf(cfg) && prints(*cfg); }))
      return true;
  }
  return false;
}

// What the statement of a loop, or of several processes, carries beside the macros.
long CompoundTransformerCfg::refuseSetting(const QString& parameter) const {
  if (!m_network)
    return 0;
  const bool isOfLoop = parameter == kMaxLoopIterationsParameter || parameter == kIterationCountParameter;
  if (isOfLoop && m_network->blockedLooping())
    return TextPlaces::refuse(TextPlace::LoopSetting, getParameterValue(parameter, UnpackLevel::Decoded));
  const bool hasGroupBy = hasParameter(kProcessGroupByParameter);
  if (parameter != (hasGroupBy ? kProcessGroupByParameter : kIdentifierParameter))
    return 0;
  const ParallelSettings settings = parallelSettingsOf(*m_network, *this);
  for (const QString& setting : {settings.groupBy, settings.parallelism, settings.processSetting}) {
    if (const long number = TextPlaces::refuse(TextPlace::ParallelSetting, setting))
      return number;
  }
  return 0;
}

// The level stands in the statement as it is stored; inside another custom transformer only its instances
// know what a reference gives.
QString CompoundTransformerCfg::refuseParallel() const {
  const ParallelSettings settings = parallelSettingsOf(*m_network, *this);
  for (const QString& setting : {settings.groupBy, settings.parallelism, settings.processSetting}) {
    if (setting.startsWith(kConditionalPrefix) || beginsValueReference(setting))
      return TransformResString(messages::kParallelByFeature);
  }
  QString level = MFBuffer::withOrdinaryMacros(settings.parallelism);
  if (listener())
    listener()->expandMacros(*this, level);
  const bool isOpen = listener() && listener()->isRunTimeValue(*this, level);
  const ParallelSettings given = m_network->getParallelSettings();
  if (!level.isEmpty() && !isOpen && !parallelLevels().contains(level))
    return TransformResString(messages::kNoParallelLevel,
                              {level, given.parallelism, parallelLevels().join(QLatin1String(", "))});
  QString ordered = MFBuffer::withOrdinaryMacros(settings.processSetting);
  if (listener())
    listener()->expandMacros(*this, ordered);
  const bool isKnown = !settings.isEnabled() || (listener() && listener()->isRunTimeValue(*this, ordered)) ||
                       isUnsetValue(ordered) || isYesOrNo(ordered);
  return isKnown ? QString()
                 : TransformResString(messages::kNoProcessSetting, {ordered, given.processSetting});
}

QStringList CompoundTransformerCfg::findUnwritablePorts() const {
  QStringList messages;
  if (!m_network)
    return messages;
  const QString parallelFault = refuseParallel();
  if (!parallelFault.isEmpty())
    messages.append(parallelFault);
  // Loops and transform factories name the ports as they are.
  const bool isBare = isRunApart(*m_network, *this);
  // What is wrong with it wherever it stands is told where the definition is embedded.
  const bool isEmbedded = m_network->getFileName().isEmpty();
  for (const QString& port : m_network->getInputs() + m_network->getOutputs()) {
    long number = isEmbedded ? 0 : TextPlaces::refuse(TextPlace::Name, port);
    if (number == 0)
      number = TextPlaces::refuse(TextPlace::QuotedName, port);
    if (number == 0 && isBare)
      number = TextPlaces::refuse(TextPlace::Port, port);
    if (number == messages::kBreaksLine)
      number = isEmbedded ? 0 : messages::kLineBreak;
    else if (number == messages::kValueUnclosed)
      number = isEmbedded ? 0 : messages::kUnclosedReference;
    if (number != 0)
      messages.append(TransformResString(number, port));
  }
  return messages;
}

// The inside is written once for all instances, so what its fragments cannot carry is found here.
long CompoundTransformerCfg::refuseMacroValue(const QString& parameter, const QString& value,
                                              std::optional<ParameterPlaces>& places) const {
  const bool isName = parameter == kIdentifierParameter;
  if (const long number = TextPlaces::refuse(TextPlace::MacroValue, value))
    return number;
  if (const long number = TextPlaces::refuse(TextPlace::MacroName, parameter))
    return number;
  if (isName && value != value.trimmed())
    return messages::kBlankAtEnd;
  const QString stored = getParameterValue(parameter);
  if (stored.startsWith(kConditionalPrefix))
    return messages::kConditionInMacro;
  const TransformParamCfg* record = getParameterByMacroName(parameter);
  const bool meansOwn = record && record->getFlag(kGUITypeInstanceMacros);
  const carried_references::Known known =
      meansOwn ? carried_references::knownWithin(*this) : carried_references::knownAround(*this);
  if (record && single_choices::refersToShownSide(*record, stored, known.expand))
    return messages::kShownSideReferred;
  const GUIType& type = getParameterGUIType(parameter);
  const bool isPerFeature = ExpressionWriter::needsWrapping(type, stored);
  const bool isDestination = isPerFeature && type.getType() == kSetterAttributeType &&
                             isParmUsedAsAttributeSetterAttribute(parameter);
  if (isPerFeature && !isDestination)
    return messages::kAttributeInMacro;
  if (const long number = isName ? 0 : carried_references::refuseInMacro(type, stored, known))
    return number;
  if (const long number = isPerFeature ? 0 : refuseEncoding(type, value))
    return number;
  QString expanded = MFBuffer::withOrdinaryMacros(value);
  const bool ends = !listener() || listener()->expandMacros(*this, expanded);
  // The name stands in quotes as it is.
  if (isName && TextPlaces::refuse(TextPlace::QuotedName, expanded) != 0)
    return messages::kIdentifierInScript;
  // Inside it begins the names of statements, where it is decoded in some and not in others.
  if (isName && QORXWwjdDecode(expanded) != expanded)
    return messages::kNameReadsEncoded;
  if (isName && TextPlaces::refuse(TextPlace::PrintedName, expanded) != 0 && printsMacroNames())
    return messages::kNoPrintedName;
  if (const long number = refuseSetting(parameter))
    return number;
  if (!ends)
    return messages::kGrowsWithoutEnd;
  if (!m_network || ParameterPlaces::fitsEverywhere(expanded))
    return 0;
  if (!places)
    places.emplace(*m_network);
  if (isName)
    return places->hasFragment() && !lookup_checks::fitsFragment(expanded) ? messages::kIdentifierInScript
                                                                           : 0;
  if (const long number = places->refuse(parameter, expanded))
    return number;
  const auto expandOwn = [this](QString& text) {
    text = replaceParameterReferences(text, [this](const QString& name, QString& own) {
      own = knownValue(name);
      return hasParameter(name);
    });
    return true;
  };
  // Of a setter's destination the call is part.
  return !isDestination && places->bringsCall(parameter, expandOwn) ? messages::kCallInValue : 0;
}

// What the parameter's macro is known to stand for.
QString CompoundTransformerCfg::knownValue(const QString& parameter) const {
  constexpr int kMostRounds = 8;
  constexpr int kLongest = 1 << 18;
  const TransformParamCfg* record = getParameterByMacroName(parameter);
  if (!record)
    return QString();
  QString value = MFBuffer::withOrdinaryMacros(macroValue(parameter, *record, QString()));
  const bool meansOwn = record->getFlag(kGUITypeInstanceMacros);
  for (int round = 0; meansOwn && round < kMostRounds && value.size() < kLongest; ++round) {
    value = replaceParameterReferences(value, [this](const QString& name, QString& own) {
      own = MFBuffer::withOrdinaryMacros(getParameterValue(name));
      return hasParameter(name);
    });
  }
  if (listener())
    listener()->expandMacros(*this, value);
  return value;
}
