#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/core/StoredValue.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/text/TextPlaces.h>

bool isMemberOf(const TransformParamCfg& record, const QString& name) {
  return record.isMultiParameter() && record.getName() != name;
}

QString storedValue(const TransformParamCfg& record, const QString& name) {
  return isMemberOf(record, name) ? record.members().memberValue(record.getValue(), name) : record.getValue();
}

void storeValue(TransformParamCfg& record, const QString& name, const QString& value) {
  if (!isMemberOf(record, name)) {
    record.setValue(value);
    return;
  }
  const GUIType* member = record.members().find(name);
  const bool isBareName =
      member && member->getType().startsWith(kAttributeType) && value.startsWith(kAttributeMark);
  const QString part = isBareName ? value.mid(1) : value;
  record.setValue(
      record.members().withMemberValue(record.isUnset() ? QString() : record.getValue(), name, part));
}

QString withAttributeReference(const GUIType& type, const QString& value) {
  const QString& word = type.getType();
  if (!value.startsWith(kAttributeMark) ||
      !(word.endsWith(kOrAttributeEncodedSuffix) ||
        (word.startsWith(kTextEditType) && word.endsWith(kOrAttributeSuffix)))) {
    return value;
  }
  return kValueReferenceWord + value.mid(1) + kEncodedRightParenthesis;
}

long refuseEncoding(const GUIType& type, const QString& value) {
  const bool isWord = type.valueIsEncoded() && !type.getType().startsWith(kExpressionType);
  return isWord ? TextPlaces::refuseEncodedValue(value) : 0;
}

QStringList possibleValues(const QString& value) {
  if (!value.startsWith(kConditionalPrefix)) {
    return QStringList(value);
  }
  const QStringList parts = value.mid(kConditionalPrefix.size()).split(QLatin1Char(';'));
  QStringList results;
  for (int i = 0; i < parts.size(); ++i) {
    if (i % 2 == 1 || i + 1 == parts.size()) {
      results.append(parts.at(i));
    }
  }
  return results;
}

bool takesAttributeReference(const GUIType& type) {
  return type.mayHoldAttributeReference() || type.getType().startsWith(kExpressionType);
}
