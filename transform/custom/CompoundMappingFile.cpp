// What an instance of a custom transformer writes into the mapping file.
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/ScriptParameters.h>
#include <transform/text/GlobalMacros.h>
#include <transform/text/MFBuffer.h>

#include <QRegularExpression>

#include <optional>

namespace {

// The flag of parameters whose references become those of the instance's own macros.
constexpr unsigned kInstanceMacros = 2048;
const QLatin1String kSetterAttributeType("STRING_OR_ATTR_ENCODED");
const QLatin1String kTeeFactory("FACTORY_DEF * TeeFactory");

QString factoryName(const QString& id, const QString& tag, const char* role) {
  return QLatin1String("  FACTORY_NAME \"") + id + QLatin1Char(' ') + tag + QLatin1String(role) +
         QLatin1Char('"');
}

// References to parameters, "$(NAME)", become references to the instance's macros. Macros that every mapping
// file has are no parameters.
QString redirectReferences(const QString& value, const QString& prefixMacro) {
  static const QRegularExpression reference(QStringLiteral("\\$\\(([^$()]*)\\)"));
  QString redirected;
  int copied = 0;
  for (auto match = reference.globalMatch(value); match.hasNext();) {
    const QRegularExpressionMatch found = match.next();
    if (isGlobalMacro(found.captured(1)))
      continue;
    redirected += value.mid(copied, found.capturedStart() - copied) + QLatin1String("$($(") + prefixMacro +
                  QLatin1String(")_") + found.captured(1) + QLatin1Char(')');
    copied = found.capturedEnd();
  }
  return redirected + value.mid(copied);
}

// "@Value(NAME)" of a name or of an encoded reference; the name keeps its encoding.
QString attributeValueForm(const QString& value) {
  if (value.isEmpty() || value == kUnusedValue || value.startsWith(kValueReference))
    return value;
  QString name = value;
  if (name.startsWith(kValueReferenceEncoded) && name.endsWith(kEncodedRightParenthesis)) {
    name = name.mid(kValueReferenceEncoded.size());
    name.chop(kEncodedRightParenthesis.size());
  }
  return kValueReference + name + QLatin1Char(')');
}

}  // namespace

bool CompoundTransformerCfg::doInstantiate(MFBuffer& buffer, bool inlineFlag) {
  if (!instantiationFault().isEmpty())
    return false;
  writeInputCollectors(buffer);
  if (!(m_network->blockedLooping() && inlineFlag)) {
    const QString id = getIdentifier();
    const QString prefix = makePrefixMacro(getVisualName());
    buffer.add(QLatin1String("MACRO ") + prefix + QLatin1Char(' ') + id);
    buffer.flush();
    writeParametersToMappingFile(buffer, prefix, false);
    m_network->saveSubdocPrefixMacro(prefix, id);
  }
  const bool written = m_network->instantiate(buffer, this, inlineFlag);
  writeOutputRenamers(buffer);
  return written;
}

void CompoundTransformerCfg::writeInputCollectors(MFBuffer& buffer) const {
  const QString id = getIdentifier();
  QStringList tags;
  getInputTags(tags);
  for (const QString& tag : qAsConst(tags)) {
    const QStringList featureTypes = getInputFeatureTypes(tag);
    if (featureTypes.isEmpty())
      continue;
    buffer.add(QString(kTeeFactory));
    buffer.add(factoryName(id, tag, " Input Collector"));
    for (const QString& featureType : featureTypes)
      buffer.add(QLatin1String("  INPUT FEATURE_TYPE ") + quotifyStringForMF(featureType));
    buffer.add(QLatin1String("  OUTPUT FEATURE_TYPE ") + quotifyStringForMF(id + QLatin1Char('_') + tag));
    buffer.flush();
  }
}

void CompoundTransformerCfg::writeOutputRenamers(MFBuffer& buffer) const {
  const QString id = getIdentifier();
  QStringList tags;
  getOutputTags(tags);
  for (const QString& tag : qAsConst(tags)) {
    buffer.add(QString(kTeeFactory));
    buffer.add(factoryName(id, tag, " Output Renamer/Nuker"));
    buffer.add(QLatin1String("  INPUT FEATURE_TYPE ") + quotifyStringForMF(id + QLatin1Char('_') + tag));
    QString featureType;
    getOutputFeatureType(tag, featureType);
    if (!featureType.isEmpty()) {
      buffer.add(QLatin1String("  OUTPUT FEATURE_TYPE ") + quotifyStringForMF(featureType));
      for (const QString& function : getOutputTagFuncs(tag))
        buffer.add(QLatin1String("    ") + function);
    }
    buffer.flush();
  }
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
  const QLatin1String keyword(defaultsOnly ? "DEFAULT_MACRO " : "MACRO ");
  std::optional<QSet<QString>> setterDestinations;  // found when the first parameter asks for them
  for (const QString& parameter : getParameters()) {
    const GUIType& type = getParameterGUIType(parameter);
    const QString stored = getParameterValue(parameter);
    const ScriptLanguage language = scriptLanguage(type);
    if (language != ScriptLanguage::None && !isUnsetScript(stored)) {
      QStringList lines;
      if (language == ScriptLanguage::Python)
        getPythonParameterLines(prefixMacro, parameter, stored, lines);
      else
        getTclParameterLines(prefixMacro, parameter, stored, lines);
      for (const QString& line : qAsConst(lines)) {
        buffer.add(line);
        buffer.flush();
      }
      continue;
    }
    QString value;
    if (language == ScriptLanguage::None) {
      value = stripBasicStringInfo(getParameterValueForMappingFile(stored, type.valueIsEncoded(), false));
      const TransformParamCfg* record = getParameterByMacroName(parameter);
      if (record && record->getFlag(kInstanceMacros) && !prefixMacro.isEmpty())
        value = redirectReferences(value, prefixMacro);
    }
    if (type.getType() == kSetterAttributeType) {
      if (!setterDestinations)
        setterDestinations = attributeSetterDestinations();
      if (setterDestinations->contains(kMacroOpen + parameter + QLatin1Char(')')))
        value = attributeValueForm(value);
    }
    const QString macro =
        prefixMacro.isEmpty() ? parameter : kMacroOpen + prefixMacro + QLatin1String(")_") + parameter;
    buffer.add(keyword + macro + QLatin1Char(' ') + value);
    buffer.flush();
  }
}
