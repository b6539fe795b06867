#include <platform/qorxcore/Lists.h>
#include <transform/core/Keywords.h>
#include <transform/core/WorkspaceParameterDirectory.h>
#include <transform/findings/Refusal.h>
#include <transform/specialised/attributes/ParameterFetcherTransformerCfg.h>
#include <transform/specialised/shared/SpecialisedValues.h>
#include <transform/text/GlobalMacros.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextHelpers.h>

namespace messages = orx::messages;

namespace {

constexpr int kFirstListVersion = 2;
constexpr int kFirstBlankVersion = 3;  // entries in braces, separated by blanks

const QLatin1String kListParameter("ATTR_LIST");
const QLatin1String kPublishedParameterType("PUBLISHED_PARAMETER");
const QLatin1Char kReferenceEnd(')');

QString separatorOf(int version) {
  return QLatin1String(version < kFirstBlankVersion ? "," : " ");
}

QStringList entriesOf(const QString& value, const QString& separator) {
  return value == kUnusedValue ? QStringList() : value.split(separator, Qt::SkipEmptyParts);
}

QString referenceTo(const QString& name) {
  return kMacroOpen + name + kReferenceEnd;
}

bool isWrapped(const QString& entry, char open, char close) {
  return entry.size() >= 2 && entry.startsWith(QLatin1Char(open)) && entry.endsWith(QLatin1Char(close));
}

bool isWrappedUnevenly(const QString& entry) {
  return isWrappedMacroReference(entry) && !isWrapped(entry, '"', '"') && !isWrapped(entry, '{', '}');
}

}  // namespace

QString ParameterFetcherTransformerCfg::attrListSeparator() const {
  return separatorOf(getVersion());
}

QString ParameterFetcherTransformerCfg::macroNameFromMacroDef(const QString& entry) const {
  return macroNamedBy(entry);
}

bool ParameterFetcherTransformerCfg::isPublishedParameter(const QString& parameter) const {
  return getVersion() < kFirstListVersion && getParameterType(parameter) == kPublishedParameterType;
}

bool ParameterFetcherTransformerCfg::holdsList(const QString& parameter) const {
  return getVersion() >= kFirstListVersion && parameter == kListParameter && hasParameter(parameter);
}

QStringList ParameterFetcherTransformerCfg::entries() const {
  return entriesOf(getParameterValue(kListParameter), attrListSeparator());
}

// --- version 1
// ------------------------------------------------------------------------------------------------

bool ParameterFetcherTransformerCfg::applyParameterValue(const QString& parameter, const QString& value) {
  if (!isPublishedParameter(parameter)) {
    return TransformerCfg::applyParameterValue(parameter, value);
  }
  QString reference = value == kUnusedValue ? QString() : value;
  if (!reference.isEmpty() && !reference.startsWith(QLatin1Char('$'))) {
    reference = referenceTo(reference);
  }
  // Without a directory nobody can say that there is no such parameter.
  if (parameterDirectory() && !parameterDirectory()->knows(reference)) {
    reference.clear();
  }
  return TransformerCfg::applyParameterValue(parameter, reference);
}

QString ParameterFetcherTransformerCfg::getParameterDisplayValue(const QString& parameter,
                                                                 UnpackLevel level) const {
  if (!isPublishedParameter(parameter)) {
    return TransformerCfg::getParameterDisplayValue(parameter, level);
  }
  const QString value = getParameterValue(parameter);
  return value.size() > 3 && isMacroReference(value) ? value.mid(2, value.size() - 3) : value;
}

QString ParameterFetcherTransformerCfg::getDefaultMacroLine(const QString& parameter) const {
  return isPublishedParameter(parameter)
             ? kDefaultMacroStatement + parameter + QLatin1Char(' ') + getParameterDisplayValue(parameter)
             : TransformerCfg::getDefaultMacroLine(parameter);
}

bool ParameterFetcherTransformerCfg::canCreateGlobalParameter(const QString& parameter) const {
  return !isPublishedParameter(parameter) && TransformerCfg::canCreateGlobalParameter(parameter);
}

// --- the list
// -------------------------------------------------------------------------------------------------

bool ParameterFetcherTransformerCfg::parameterSupportsAttributeReference(const QString& parameter) const {
  return parameter == kListParameter || TransformerCfg::parameterSupportsAttributeReference(parameter);
}

bool ParameterFetcherTransformerCfg::validateParameter(const QString& parameter, QString& message) const {
  if (!holdsList(parameter)) {
    return TransformerCfg::validateParameter(parameter, message);
  }
  if (!parameterDirectory()) {
    return true;
  }
  for (const QString& entry : entries()) {
    // What begins in one way and ends in another is no wrapping when the list is split for the attributes.
    if (isWrappedUnevenly(entry) || !parameterDirectory()->knows(referenceTo(macroNameFromMacroDef(entry)))) {
      return orx::refuse(message, messages::kUnknownWorkspaceParameter, {entry});
    }
  }
  return true;
}

QString ParameterFetcherTransformerCfg::getParameterValueForMappingFile(const QString& name,
                                                                        const TransformParamCfg* parameter,
                                                                        MFBuffer& buffer) const {
  if (name != kListParameter) {
    return TransformerCfg::getParameterValueForMappingFile(name, parameter, buffer);
  }
  const QString stored = stripBasicStringInfo(getParameterValue(name));
  QStringList list = entriesOf(stored, attrListSeparator());
  const bool usesBraces = getVersion() >= kFirstBlankVersion;
  const char open = usesBraces ? '{' : '"';
  const char close = usesBraces ? '}' : '"';
  const bool isSingle = list.size() < 2;
  for (QString& entry : list) {
    if (isWrapped(entry, open, close)) {
      continue;
    }
    if (isWrappedMacroReference(entry)) {
      // In what another version wraps its entries.
      entry = entry.mid(1, entry.size() - 2);
    }
    if (!isSingle) {
      entry = QLatin1Char(open) + entry + QLatin1Char(close);
    }
  }
  // Without the empty pieces: they would be entries of their own beside a single one.
  const QString written = isUnsetValue(stored) ? stored : list.join(attrListSeparator());
  return textForMappingFile(written, name, parameter, buffer);
}

QStringList ParameterFetcherTransformerCfg::fetchedAttributes() const {
  const QStringList list = QORXStringToList(getParameterValue(kListParameter), attrListSeparator().at(0));
  QStringList names;
  for (const QString& entry : list) {
    const QString macro = macroNameFromMacroDef(entry);
    // A single text that names no macro is not known to be a name at all.
    if (!macro.isEmpty() || list.size() > 1) {
      names.append(macro.isEmpty() ? entry : macro);
    }
  }
  return names;
}

void ParameterFetcherTransformerCfg::transformAllAttrs(QStringList& incoming, QStringList& result,
                                                       const QString& inputTag,
                                                       const QString& outputTag) const {
  TransformerCfg::transformAllAttrs(incoming, result, inputTag, outputTag);
  // A single entry is an attribute that the definition adds.
  const QStringList fetched = getVersion() >= kFirstListVersion ? fetchedAttributes() : QStringList();
  if (fetched.size() > 1) {
    result += fetched;
  }
}

void ParameterFetcherTransformerCfg::getTooltipLines(QStringList& lines, bool asHtml) const {
  TransformerCfg::getTooltipLines(lines, asHtml);
  const QStringList names = getVersion() >= kFirstListVersion ? fetchedAttributes() : QStringList();
  if (!names.isEmpty()) {
    const QString text = names.join(QLatin1String(", "));
    lines.append(asHtml ? text.toHtmlEscaped() : text);
  }
}

bool ParameterFetcherTransformerCfg::upgradeTransformer(TransformerCfg* older) {
  const bool isComplete = TransformerCfg::upgradeTransformer(older);
  if (!older || older == this || !holdsList(kListParameter)) {
    return isComplete;
  }
  QStringList list;
  const int version = older->getVersion();
  if (version < kFirstListVersion) {
    for (const QString& name : older->getParameters()) {
      const QString value = older->getParameterValue(name);
      if (older->getParameterType(name) == kPublishedParameterType && !value.isEmpty()) {
        list.append(value);
      }
    }
  } else {
    for (const QString& entry : entriesOf(older->getParameterValue(kListParameter), separatorOf(version))) {
      const bool isBare = !isWrapped(entry, '"', '"') && !isWrapped(entry, '{', '}');
      const QString text = isBare ? entry : entry.mid(1, entry.size() - 2);
      // Names that are shown to people may hold the new separator, those of macros do not.
      const QString macro = globalMacroName(text);
      list.append(macro.isEmpty() ? text : macro);
    }
  }
  setParameterValue(kListParameter, list.join(attrListSeparator()), false);
  return isComplete;
}
