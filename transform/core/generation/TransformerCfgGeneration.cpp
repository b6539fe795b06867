// The part of TransformerCfg that writes its statements into the mapping file.
#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/MacroText.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/attributes/PortTexts.h>
#include <transform/core/definition/CompiledTemplate.h>
#include <transform/core/generation/LookupWriters.h>
#include <transform/core/generation/MultiProcessWriter.h>
#include <transform/core/generation/OrderedSubstitution.h>
#include <transform/core/generation/ParameterSubstitution.h>
#include <transform/core/generation/TemplateExpansion.h>
#include <transform/core/generation/ValueConversion.h>
#include <transform/core/validation/MappingFileChecks.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/TextHelpers.h>

#include <QScopeGuard>

#include <algorithm>
#include <typeinfo>

namespace {

const QLatin1String kSchemaType("varchar(255)");
const QLatin1String kUserTypedEnd("_USERTYPED)");
const QLatin1String kNo("NO");
const QLatin1String kChoiceType("CHOICE");

// For statements that are only tried.
class UnusedBuffer : public MFBuffer {
 public:
  void write(const QByteArray&) override {}
};

bool isUnset(const QString& value) {
  return value.isEmpty() || value == kUnusedValue;
}

}  // namespace

// --- statements
// ---------------------------------------------------------------------------------------------

bool TransformerCfg::instantiate(MFBuffer& buffer, const QString&, bool inlineFlag) {
  const bool before = buffer.getReplaceDeferredMacros();
  buffer.setReplaceDeferredMacros(true);
  const auto restore = qScopeGuard([&] { buffer.setReplaceDeferredMacros(before); });
  const QString& groupByParameter = configured().fields.multiProcess;
  if (!groupByParameter.isEmpty()) {
    const auto stored = [this](const QString& name) {
      const TransformParamCfg* record = getParameterByMacroName(name);
      return record ? record->choices().toStored(getParameterValue(name)) : QString();
    };
    const QString parallelism = stored(kProcessCountParameter);
    const QString groupBy = getParameterValue(groupByParameter);
    if (parallelism != kNoParallelism && parallelism != kNo && groupBy != kUnusedGroupBy) {
      // The factory is of no use without the statements that its workers run.
      UnusedBuffer unused;
      unused.setReplaceDeferredMacros(true);
      const int count = m_instantiationCounter;
      if (!doInstantiate(unused, inlineFlag) ||
          !multi_process_writer::write(buffer, *this, groupBy, parallelism,
                                       stored(kGroupsOrderedParameter))) {
        return false;
      }
      m_instantiationCounter = count;
    }
  }
  return doInstantiate(buffer, inlineFlag);
}

bool TransformerCfg::hasPlainPorts() const {
  return typeid(*this) == typeid(TransformerCfg);
}

bool TransformerCfg::doInstantiate(MFBuffer& buffer, bool) {
  ensureBaseGuid();
  QStringList lines;
  if (!expandTemplate(buffer, lines) ||
      !std::all_of(lines.cbegin(), lines.cend(), &MFBuffer::closesDeferredMacros)) {
    return false;
  }
  for (const QString& line : std::as_const(lines)) {
    buffer.add(line);
    buffer.flush();
  }
  return true;
}

bool TransformerCfg::expandTemplate(MFBuffer& buffer, QStringList& lines) {
  const CompiledTemplate* compiled = configured().compiledTemplate.get();
  ParameterSubstitution values(*this, m_parameters.records());
  if (compiled && compiled->isPlain() && compiled->hasOneLineClauses() && hasPlainPorts()) {
    // A class of its own may write statements for any parameter.
    values.collect(buffer, typeid(*this) == typeid(TransformerCfg) ? compiled : nullptr);
    if (!values.bringsTokens()) {
      TemplateExpansion expansion(*compiled);
      if (fillPorts(expansion, *compiled, values)) {
        values.apply(expansion, *compiled);
        if (expansion.holds(compiled->slotOf(kValueListToken))) {
          expansion.setValue(compiled->slotOf(kValueListToken), values.valueList());
        }
        fillInstanceTokens([&](const QString& token) { return expansion.holds(compiled->slotOf(token)); },
                           [&](const QString& token, const QString& text) {
                             expansion.setValue(compiled->slotOf(token), text);
                           });
        lines = expansion.lines();
        return true;
      }
    }
    values.collectRest(buffer);
    return expandInOrder(values, lines);
  }
  values.collect(buffer);
  return expandInOrder(values, lines);
}

bool TransformerCfg::expandInOrder(const ParameterSubstitution& values, QStringList& lines) {
  lines = getTemplateLines();
  substInputs(lines);
  substOutputs(lines);
  OrderedSubstitution ordered(lines);
  const bool wantsList = ordered.contains(kValueListToken);
  values.apply(ordered);
  if (wantsList) {
    ordered.substitute(kValueListToken, values.valueList());
  }
  fillInstanceTokens([&](const QString& token) { return ordered.contains(token); },
                     [&](const QString& token, const QString& text) { ordered.substitute(token, text); });
  lines = ordered.lines();
  return !ordered.isTooLarge();
}

void TransformerCfg::fillInstanceTokens(
    const std::function<bool(const QString& token)>& holds,
    const std::function<void(const QString& token, const QString& text)>& substitute) {
  if (!m_baseGuid.isEmpty()) {
    if (holds(kUuidToken)) {
      substitute(kUuidToken, getParameterValue(kIdentifierParameter, UnpackLevel::Decoded) +
                                 QLatin1Char('_') + m_baseGuid + QString::number(m_instantiationCounter));
    }
    ++m_instantiationCounter;
  }
  if (holds(kEncodedNameToken)) {
    substitute(kEncodedNameToken,
               encodeAroundReferences(stripBasicStringInfo(getParameterValue(kIdentifierParameter))));
  }
  if (holds(kSchemaToken)) {
    const QString type = QORXWwjdEncode(kSchemaType);
    QStringList schema;
    for (const QString& attribute : getInputAttributeUnion()) {
      if (!attribute.contains(kListMark)) {
        schema << getParameterValueForMappingFile(attribute, ValueEncoding::Plain, ValueEncoding::Word, false)
               << type;
      }
    }
    substitute(kSchemaToken, QORXListToSdfString(schema, QLatin1Char(',')));
  }
}

// --- tokens
// -------------------------------------------------------------------------------------------------

bool TransformerCfg::containsToken(const QStringList& lines, const QString& token) {
  const QString reference = kMacroOpen + token + QLatin1Char(')');
  return std::any_of(lines.cbegin(), lines.cend(),
                     [&](const QString& line) { return line.contains(reference); });
}

void TransformerCfg::substToken(QStringList& lines, const QString& token, const QString& value) {
  OrderedSubstitution ordered(lines);
  ordered.substitute(token, value);
  lines = ordered.lines();
}

void TransformerCfg::removeLinesWithToken(QStringList& lines, const QString& token) {
  OrderedSubstitution ordered(lines);
  ordered.removeLinesWith(token);
  lines = ordered.lines();
}

void TransformerCfg::removeOutputClause(QStringList& lines, const QString& tag, bool wildcard) {
  OrderedSubstitution ordered(lines);
  ordered.removeOutputClause(tag, wildcard);
  lines = ordered.lines();
}

void TransformerCfg::substParametersForMappingFile(MFBuffer& buffer, QStringList& lines) const {
  ParameterSubstitution values(*this, m_parameters.records());
  values.collect(buffer);
  OrderedSubstitution ordered(lines);
  const bool wantsList = ordered.contains(kValueListToken);
  values.apply(ordered);
  if (wantsList) {
    ordered.substitute(kValueListToken, values.valueList());
  }
  lines = ordered.lines();
}

// --- ports
// --------------------------------------------------------------------------------------------------

void TransformerCfg::substInputs(QStringList& lines) const {
  OrderedSubstitution ordered(lines);
  port_texts::InputTexts all;
  QStringList tags;
  getInputTags(tags);
  for (const QString& tag : std::as_const(tags)) {
    ordered.substitute(kInputTokenStart + tag + kInputTokenEnd, all.add(*this, m_ports, tag));
  }
  ordered.substitute(kInputLinesToken, all.text());
  lines = ordered.lines();
}

void TransformerCfg::substOutputs(QStringList& lines) const {
  OrderedSubstitution ordered(lines);
  QStringList tags;
  getOutputTags(tags);
  for (const QString& tag : std::as_const(tags)) {
    QString featureType;
    if (port_texts::isOutputWritten(*this, tag, featureType)) {
      ordered.substitute(kOutputTokenStart + tag + kFeatureTypeTokenEnd, quotifyStringForMF(featureType));
      ordered.substitute(kOutputTokenStart + tag + kFunctionsTokenEnd,
                         port_texts::outputFunctions(*this, tag));
    } else {
      ordered.removeOutputClause(tag, false);
    }
  }
  lines = ordered.lines();
}

bool TransformerCfg::fillPorts(TemplateExpansion& expansion, const CompiledTemplate& compiled,
                               const ParameterSubstitution& values) const {
  const auto fill = [&](int slot, const QString& text) {
    expansion.setValue(slot, text);
    return TemplateExpansion::isInert(text, [&](const QString& name) { return values.isSubstituted(name); });
  };
  QStringList tags;
  getInputTags(tags);
  port_texts::InputTexts all;
  bool isInert = true;
  for (const QString& tag : std::as_const(tags)) {
    isInert = fill(compiled.slotOf(kInputTokenStart + tag + kInputTokenEnd), all.add(*this, m_ports, tag)) &&
              isInert;
  }
  isInert = fill(compiled.slotOf(kInputLinesToken), all.text()) && isInert;
  tags.clear();
  getOutputTags(tags);
  for (const QString& tag : std::as_const(tags)) {
    const QString start = kOutputTokenStart + tag;
    const int typeSlot = compiled.slotOf(start + kFeatureTypeTokenEnd);
    QString featureType;
    if (port_texts::isOutputWritten(*this, tag, featureType)) {
      isInert = fill(typeSlot, quotifyStringForMF(featureType)) && isInert;
      isInert = fill(compiled.slotOf(start + kFunctionsTokenEnd), port_texts::outputFunctions(*this, tag)) &&
                isInert;
    } else {
      expansion.removeLinesOf(typeSlot);
    }
  }
  return isInert;
}

QStringList TransformerCfg::getTransformFactoryInputLines() const {
  QStringList lines;
  QStringList tags;
  getInputTags(tags);
  for (const QString& tag : std::as_const(tags)) {
    for (const QString& line : port_texts::inputLines(*this, m_ports, tag)) {
      lines.append(QLatin1String("   ") + line);
    }
  }
  return lines;
}

// --- values
// -------------------------------------------------------------------------------------------------

QString TransformerCfg::getParameterValueForMappingFile(const QString& name,
                                                        const TransformParamCfg* parameter,
                                                        MFBuffer& buffer) const {
  return textForMappingFile(stripBasicStringInfo(getParameterValue(name)), name, parameter, buffer);
}

QString TransformerCfg::textForMappingFile(QString value, const QString& name,
                                           const TransformParamCfg* parameter, MFBuffer& buffer) const {
  if (name == kIdentifierParameter) {
    return value.contains(kMacroOpen) ? quotifyString(value, QStringLiteral(" ")) : quotifyStringForMF(value);
  }
  const TransformParamCfg* record = parameter ? parameter : getParameterByMacroName(name);
  if (!record || (isUnset(value) && record->getFlag(kGUITypeOmittable))) {
    return value;
  }
  const QString& type = record->getType();
  const ChoiceList& choices = record->choices();
  const bool isEncoded = record->valueIsEncoded();
  if (record->isMultiParameter()) {
    return wrapInEvaluateExpression(value, name, record->getTypeWithConfig(), isEncoded);
  }
  if (record->isTable() && !value.startsWith(kConditionalPrefix)) {
    return wrapGuiTableInEvaluateExpression(*record, value);
  }
  const bool isPerFeature = ExpressionWriter::needsWrapping(*record, value);
  if (isPerFeature) {
    value =
        wrapInEvaluateExpression(ExpressionWriter::withStoredResults(value, choices), name, type, isEncoded);
  }
  if (type == kTextEncodedType) {
    value = encodeUserString(value);
  }
  if (isPerFeature) {
    return value;
  }
  if (record->mayHoldAttributeReference() || (!choices.isEmpty() && !choices.contains(value))) {
    value = getParameterValueForMappingFile(value, isEncoded, false);
  }
  return choices.hasLookup() ? lookedUp(buffer, name, *record, value) : value;
}

QString TransformerCfg::lookedUp(MFBuffer& buffer, const QString& name, const TransformParamCfg& record,
                                 const QString& value) const {
  const ChoiceList& choices = record.choices();
  const QString own = m_baseGuid + name;
  const bool isListBox = ORX_isListBoxType(record);
  const bool isRunTime = m_listener && m_listener->isRunTimeValue(*this, value);
  const bool isProcedure = !isRunTime && record.getType().startsWith(kChoiceType);
  // A text that would keep the buffer busy for ever is left to the caller's checks.
  if ((isRunTime || isProcedure) && !mapping_file_checks::closesDeferredMacros(
                                        choices, {value, record.getDescription(), getIdentifier()})) {
    return value;
  }
  if (isRunTime) {
    const bool isOptional = record.getFlag(kGUITypeOptional);
    if (isListBox) {
      writeListBoxLookup(buffer, choices, value, record.getDescription(), own, isOptional);
    } else {
      writeChoiceBoxLookup(buffer, choices, value, record.getDescription(), own, isOptional);
    }
    return kMacroOpen + own + QLatin1Char(')');
  }
  if (isProcedure) {
    return ExpressionWriter::holdsReference(value) ? value
                                                   : writeChoiceLookupTclFunc(buffer, name, choices, value);
  }
  if (!isListBox) {
    return choices.toStored(value);
  }
  QStringList selected = QORXSdfStringToList(value, QLatin1Char(' '));
  bool isKnown = false;
  for (QString& element : selected) {
    const QString stored = choices.toStored(element);
    isKnown = isKnown || stored != element;
    element = stored;
  }
  return isKnown ? QORXListToSdfString(selected, QLatin1Char(' ')) : value;
}

QString TransformerCfg::getParameterValueForMappingFile(const QString& value, ValueEncoding from,
                                                        ValueEncoding to, bool quote) {
  return value_conversion::convert(value, from, to, quote);
}

QString TransformerCfg::getParameterValueForMappingFile(const QString& value, bool isEncoded, bool quote) {
  const ValueEncoding encoding = isEncoded ? ValueEncoding::Word : ValueEncoding::Plain;
  return getParameterValueForMappingFile(value, encoding, encoding, quote);
}

QString TransformerCfg::wrapInEvaluateExpression(const QString& value, const QString& name,
                                                 const QString& type, bool encoded) const {
  const ExpressionWriter writer(m_lastParmEditBuild > floatDivisionBuild);
  if (!type.startsWith(kMultiParameterType) || value.startsWith(kConditionalPrefix)) {
    return writer.wrap(value, name, type, encoded);
  }
  return writer.wrapMembers(value, MemberList(GUIType::fromTransformerTypeString(type, name)));
}

QString TransformerCfg::wrapGuiTableInEvaluateExpression(const TransformParamCfg& parameter,
                                                         const QString& value) const {
  const ExpressionWriter writer(m_lastParmEditBuild > floatDivisionBuild);
  return writer.wrapCells(value, parameter.getName(), parameter.members());
}

void TransformerCfg::writeChoiceBoxLookup(MFBuffer& buffer, const ChoiceList& lookup, const QString& value,
                                          const QString& prompt, const QString& macro, bool optional) const {
  lookup_writers::writeChoiceBox(buffer, lookup, {value, prompt, macro, getIdentifier(), optional});
}

void TransformerCfg::writeListBoxLookup(MFBuffer& buffer, const ChoiceList& lookup, const QString& value,
                                        const QString& prompt, const QString& macro, bool optional) const {
  lookup_writers::writeListBox(buffer, lookup, {value, prompt, macro, getIdentifier(), optional});
}

QString TransformerCfg::writeChoiceLookupTclFunc(MFBuffer& buffer, const QString& name,
                                                 const ChoiceList& lookup, const QString& value) const {
  return lookup_writers::writeChoiceProcedure(buffer, lookup, m_baseGuid + name, value);
}

// --- macros and transform factories
// -------------------------------------------------------------------------

QString TransformerCfg::getDefaultMacroLine(const QString& parameter) const {
  return kDefaultMacroStatement + parameter + QLatin1Char(' ') +
         getDefaultMacroValue(parameter, UnpackLevel::Resolved);
}

QString TransformerCfg::getDefaultMacroValue(const QString& name, UnpackLevel level) const {
  QString value = getParameterValue(name, level);
  if (value != kUnusedValue) {
    return value;
  }
  const TransformParamCfg* record = getParameterByMacroName(name);
  QString defaultValue = record ? record->getDefaultValue() : QString();
  if (defaultValue == kUnusedValue) {
    defaultValue.clear();
  }
  return m_listener ? m_listener->resolveDefaultValue(*this, defaultValue) : defaultValue;
}

bool TransformerCfg::useBracketValueSyntax() const {
  const CompiledTemplate* compiled = configured().compiledTemplate.get();
  return compiled && compiled->usesBracketValues();
}

QString TransformerCfg::resolveUserTypedMacro(const QString& value, UnpackLevel level) const {
  return m_listener && value.contains(kUserTypedEnd) ? m_listener->resolveUserTypedMacro(*this, value, level)
                                                     : value;
}

QString TransformerCfg::getTransformerParams() const {
  QString list;
  for (const TransformParamCfg& record : m_parameters.records()) {
    const QString& name = record.getName();
    if (name == kIdentifierParameter || !ParameterSubstitution::hasValue(record)) {
      continue;
    }
    if (!list.isEmpty()) {
      list += QLatin1Char(',');
    }
    list += QORXWwjdEncode(name) + QLatin1Char(',') +
            encodeAroundReferences(stripBasicStringInfo(getParameterValue(name)));
  }
  return list;
}

void TransformerCfg::writeMultiProcessTransformFact(MFBuffer& buffer, const QString& groupBy,
                                                    const QString& parallelism,
                                                    const QString& processSetting) const {
  multi_process_writer::write(buffer, *this, groupBy, parallelism, processSetting);
}

QHash<QString, QString> TransformerCfg::findUnwritableValues() const {
  return MappingFileChecks(*this, m_parameters.records()).find();
}
