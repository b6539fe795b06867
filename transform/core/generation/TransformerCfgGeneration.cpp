// The part of TransformerCfg that writes its statements into the mapping file.
#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/LookupChecks.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/attributes/PortTexts.h>
#include <transform/core/definition/CompiledTemplate.h>
#include <transform/core/generation/LookupDecision.h>
#include <transform/core/generation/LookupWriters.h>
#include <transform/core/generation/MultiProcessWriter.h>
#include <transform/core/generation/OrderedSubstitution.h>
#include <transform/core/generation/ParameterSubstitution.h>
#include <transform/core/generation/TemplateExpansion.h>
#include <transform/core/generation/ValueConversion.h>
#include <transform/core/generation/WrittenValues.h>
#include <transform/core/validation/MappingFileChecks.h>
#include <transform/core/validation/OwnTokens.h>
#include <transform/text/MacroText.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/NullBuffer.h>
#include <transform/text/TextHelpers.h>

#include <QScopeGuard>

#include <algorithm>
#include <typeinfo>

namespace messages = orx::messages;

namespace {

const QLatin1String kSchemaType("varchar(255)");
const QLatin1String kUserTypedEnd("_USERTYPED)");

}  // namespace

// --- statements
// ---------------------------------------------------------------------------------------------

bool TransformerCfg::instantiate(MFBuffer& buffer, const QString&, bool inlineFlag) {
  const bool before = buffer.getReplaceDeferredMacros();
  buffer.setReplaceDeferredMacros(true);
  const auto restore = qScopeGuard([&] { buffer.setReplaceDeferredMacros(before); });
  const multi_process_writer::Settings parallel = multi_process_writer::settingsOf(*this);
  if (parallel.isEnabled) {
    // The factory is of no use without the statements that its workers run.
    NullBuffer unused;
    unused.setReplaceDeferredMacros(true);
    const int count = m_instantiationCounter;
    if (!doInstantiate(unused, inlineFlag) ||
        !multi_process_writer::write(buffer, *this, parallel.groupBy, parallel.parallelism,
                                     parallel.processSetting)) {
      return false;
    }
    m_instantiationCounter = count;
  }
  return doInstantiate(buffer, inlineFlag);
}

bool TransformerCfg::doInstantiate(MFBuffer& buffer, bool) {
  ensureBaseGuid();
  QStringList lines;
  const bool isExpanded = expandTemplate(buffer, lines);
  ++m_instantiationCounter;
  if (!isExpanded || !std::all_of(lines.cbegin(), lines.cend(), &MFBuffer::closesDeferredMacros)) {
    return false;
  }
  for (const QString& line : std::as_const(lines)) {
    buffer.add(line);
    buffer.flush();
  }
  return true;
}

// A class of its own may override the port steps, or write statements for any parameter.
bool TransformerCfg::expandTemplate(MFBuffer& buffer, QStringList& lines) {
  const CompiledTemplate* compiled = configured().compiledTemplate.get();
  ParameterSubstitution values(*this, m_parameters.records());
  if (compiled && compiled->isPlain() && compiled->hasOneLineClauses() &&
      typeid(*this) == typeid(TransformerCfg)) {
    const PortTexts ports = portTexts();
    if (!bringsTokens(values, ports)) {
      TemplateExpansion expansion(*compiled);
      ports.putInto(expansion);
      values.collect(buffer, /*onlyWritten=*/true);
      values.putInto(expansion);
      putInstanceTokens(expansion);
      lines = expansion.lines();
      return true;
    }
  }
  return expandInOrder(values, buffer, lines);
}

bool TransformerCfg::expandInOrder(ParameterSubstitution& values, MFBuffer& buffer,
                                   QStringList& lines) const {
  m_isTooLarge = false;
  lines = getTemplateLines();
  substInputs(lines);
  substOutputs(lines);
  values.collect(buffer);
  substitute(lines, [&values](Substitution& ordered) { values.putInto(ordered); });
  substitute(lines, [this](Substitution& ordered) { putInstanceTokens(ordered); });
  return !m_isTooLarge;
}

template <class Step>
void TransformerCfg::substitute(QStringList& lines, Step step) const {
  OrderedSubstitution ordered(lines);
  step(ordered);
  m_isTooLarge = m_isTooLarge || ordered.isTooLarge();
  lines = ordered.lines();
}

PortTexts TransformerCfg::portTexts() const {
  PortTexts texts;
  texts.addInputs(*this, m_ports);
  texts.addOutputs(*this);
  return texts;
}

bool TransformerCfg::bringsTokens(const ParameterSubstitution& values, const PortTexts& ports) {
  return values.bringsTokens() || !ports.allOf([&](const QString& text) { return values.isInert(text); });
}

void TransformerCfg::putInstanceTokens(Substitution& lines) const {
  if (!m_baseGuid.isEmpty() && lines.contains(kUuidToken)) {
    lines.substitute(kUuidToken, getParameterValue(kIdentifierParameter, UnpackLevel::Decoded) +
                                     QLatin1Char('_') + m_baseGuid + QString::number(m_instantiationCounter));
  }
  if (lines.contains(kEncodedNameToken)) {
    lines.substitute(kEncodedNameToken,
                     encodeAroundReferences(stripBasicStringInfo(getParameterValue(kIdentifierParameter))));
  }
  if (lines.contains(kSchemaToken)) {
    const QString type = QORXWwjdEncode(kSchemaType);
    QStringList schema;
    for (const QString& attribute : getInputAttributeUnion()) {
      if (!attribute.contains(kListMark)) {
        schema << getParameterValueForMappingFile(attribute, ValueEncoding::Plain, ValueEncoding::Word, false)
               << type;
      }
    }
    lines.substitute(kSchemaToken, QORXListToSdfString(schema, QLatin1Char(',')));
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
  substitute(lines, [&values](Substitution& ordered) { values.putInto(ordered); });
}

// --- ports
// --------------------------------------------------------------------------------------------------

void TransformerCfg::substInputs(QStringList& lines) const {
  PortTexts texts;
  texts.addInputs(*this, m_ports);
  substitute(lines, [&texts](Substitution& ordered) { texts.putInto(ordered); });
}

void TransformerCfg::substOutputs(QStringList& lines) const {
  PortTexts texts;
  texts.addOutputs(*this);
  substitute(lines, [&texts](Substitution& ordered) { texts.putInto(ordered); });
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
  if (!record || (isUnsetValue(value) && record->getFlag(kGUITypeOmittable))) {
    return value;
  }
  const QString& type = record->getType();
  const ChoiceList& choices = record->choices();
  const bool isEncoded = record->valueIsEncoded();
  if (record->isMultiParameter()) {
    return wrapInEvaluateExpression(single_choices::toStored(*record, value), name,
                                    record->getTypeWithConfig(), isEncoded);
  }
  if (record->isTable() && !value.startsWith(kConditionalPrefix)) {
    return wrapGuiTableInEvaluateExpression(*record, single_choices::toStored(*record, value));
  }
  const bool isPerFeature = ExpressionWriter::needsWrapping(*record, value);
  if (isPerFeature) {
    value = wrapInEvaluateExpression(single_choices::toStored(*record, value), name, type, isEncoded);
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
  return lookedUp(buffer, name, *record, value);
}

QString TransformerCfg::lookedUp(MFBuffer& buffer, const QString& name, const TransformParamCfg& record,
                                 const QString& value) const {
  const ChoiceList& choices = record.choices();
  const QString own = m_baseGuid + name;
  const LookupKind kind = lookupKind(*this, record, value);
  const bool writesFragment = kind == LookupKind::RunTime || kind == LookupKind::Procedure;
  // A text that would keep the buffer busy for ever is left to the caller's checks.
  if (writesFragment && !mapping_file_checks::closesDeferredMacros(
                            choices, {value, record.getDescription(), getIdentifier()})) {
    return value;
  }
  switch (kind) {
    case LookupKind::None:
      return isUnsetValue(value) ? value : single_choices::toStored(record, value);
    case LookupKind::RunTime: {
      const bool isOptional = record.getFlag(kGUITypeOptional);
      if (ORX_isListBoxType(record)) {
        writeListBoxLookup(buffer, choices, value, record.getDescription(), own, isOptional);
      } else {
        writeChoiceBoxLookup(buffer, choices, value, record.getDescription(), own, isOptional);
      }
      return kMacroOpen + own + QLatin1Char(')');
    }
    case LookupKind::Procedure:
      return writeChoiceLookupTclFunc(buffer, name, choices, value);
    case LookupKind::Stored:
      break;
  }
  return single_choices::toStored(record, value);
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
    if (name == kIdentifierParameter || !WrittenValues::hasValue(record)) {
      continue;
    }
    if (!list.isEmpty()) {
      list += QLatin1Char(',');
    }
    const QString value = stripBasicStringInfo(single_choices::toStored(record, getParameterValue(name)));
    list +=
        QORXWwjdEncode(name) + QLatin1Char(',') +
        QORXWwjdEncode(MFBuffer::closesDeferredMacros(value) ? MFBuffer::withOrdinaryMacros(value) : value);
  }
  return list;
}

void TransformerCfg::writeMultiProcessTransformFact(MFBuffer& buffer, const QString& groupBy,
                                                    const QString& parallelism,
                                                    const QString& processSetting) const {
  multi_process_writer::write(buffer, *this, groupBy, parallelism, processSetting);
}

QHash<QString, QString> TransformerCfg::findUnwritableValues() const {
  const ParameterSubstitution values(*this, m_parameters.records());
  if (!bringsTokens(values, portTexts())) {
    return MappingFileChecks(*this, m_parameters.records(), nullptr).find();
  }
  NullBuffer buffer;
  ParameterSubstitution tried(*this, m_parameters.records());
  QStringList lines;
  const bool ends = expandInOrder(tried, buffer, lines);
  const OwnTokens tokens(*this, tried);
  QHash<QString, QString> messages = MappingFileChecks(*this, m_parameters.records(), &tokens).find();
  if (!ends) {
    const QString culprit = values.firstWithTokens();
    messages.insert(culprit.isEmpty() ? QString(kIdentifierParameter) : culprit,
                    TransformResString(messages::kGrowsWithoutEnd));
  }
  return messages;
}
