#include <platform/qorxcore/Lists.h>
#include <transform/workspace/records/RecordTables.h>
#include <transform/workspace/records/ValueText.h>

namespace tables {

namespace {

const QLatin1Char kSeparator(',');
const QLatin1Char kQuote('"');

// Whether each element that begins with a quote ends with one.
bool isWellQuoted(const QString& list) {
  const auto skipBlanks = [&](int at) {
    while (at < list.size() && (list[at] == QLatin1Char(' ') || list[at] == QLatin1Char('\t')))
      ++at;
    return at;
  };
  for (int at = 0; at < list.size(); ++at) {
    at = skipBlanks(at);
    if (at < list.size() && list[at] == kQuote) {
      do {
        at = list.indexOf(kQuote, at + 1);
        if (at < 0)
          return false;
        ++at;
      } while (at < list.size() && list[at] == kQuote);
      at = skipBlanks(at);
      if (at < list.size() && list[at] != kSeparator)
        return false;
    } else {
      at = list.indexOf(kSeparator, at);
      if (at < 0)
        break;
    }
  }
  return true;
}

}  // namespace

bool readAttributesToRemove(FeatureTypeStruct& record, const QString& text) {
  record.dynamicSchemaInfo.setAttributesToRemove(QORXSdfStringToList(text, kSeparator));
  return isWellQuoted(text);
}

QString writeAttributesToRemove(const FeatureTypeStruct& record) {
  return QORXListToSdfString(record.dynamicSchemaInfo.getAttributesToRemove(), kSeparator);
}

bool readTransformerPosition(TransformerStruct& record, const QString& text) {
  return valuetext::read(QStringView(text), record.position);
}

QString writeTransformerPosition(const TransformerStruct& record) {
  static const QRectF none;
  const QRectF& rectangle = record.boundingRect;
  const bool hasRectangle = std::tuple(rectangle.x(), rectangle.y(), rectangle.width(), rectangle.height()) !=
                            std::tuple(none.x(), none.y(), none.width(), none.height());
  QString text;
  valuetext::append(text, hasRectangle ? rectangle.topLeft() : record.position);
  return text;
}

bool readStandAlone(GlobalParameterStruct& record, const QString& text) {
  record.isStandAlone = text == words::kTrue.view();
  record.isServer = text == words::kServer.view();
  return record.isStandAlone || record.isServer || text == words::kFalse.view();
}

QString writeStandAlone(const GlobalParameterStruct& record) {
  const Word& word = record.isServer ? words::kServer : record.isStandAlone ? words::kTrue : words::kFalse;
  return word.toQString();
}

bool readPortKind(SubDocumentIOStruct& record, const QString& text) {
  if (text == words::kLoop.view())
    record.isSource = SubDocumentIOKind::Loop;
  else if (text == words::kTrue.view())
    record.isSource = SubDocumentIOKind::Input;
  else
    record.isSource = SubDocumentIOKind::Output;
  return record.isSource != SubDocumentIOKind::Output || text == words::kFalse.view();
}

QString writePortKind(const SubDocumentIOStruct& record) {
  switch (record.isSource) {
    case SubDocumentIOKind::Loop:
      return words::kLoop.toQString();
    case SubDocumentIOKind::Input:
      return words::kTrue.toQString();
    case SubDocumentIOKind::Output:
      break;
  }
  return words::kFalse.toQString();
}

}  // namespace tables
