#include <platform/qorxcore/Local8Bit.h>
#include <transform/custom/CustomTransformerHeader.h>
#include <transform/files/LineReader.h>

namespace {

const QByteArray kBegin = QByteArrayLiteral("# TRANSFORMER_BEGIN ");
const QByteArray kEnd = QByteArrayLiteral("# TRANSFORMER_END");
const QByteArray kDefinitionPrefix = QByteArrayLiteral("# ");
constexpr int kNeededFields = 3;
// An attribute of a document may fill a line, its characters escaped.
constexpr qint64 kLongestLine = 128 * 1024 * 1024;

QStringList splitFields(const QByteArray& line) {
  QStringList fields = QORXFromLocal8Bit(line.mid(kBegin.size())).split(QLatin1Char(','));
  for (QString& field : fields) {
    const auto isBlank = [](QChar c) {
      return c == QLatin1Char(' ') || c == QLatin1Char('\n') || c == QLatin1Char('\t');
    };
    int begin = 0;
    int end = field.size();
    while (begin < end && isBlank(field.at(begin)))
      ++begin;
    while (end > begin && isBlank(field.at(end - 1)))
      --end;
    field = field.mid(begin, end - begin);
  }
  return fields;
}

}  // namespace

int CustomTransformerHeader::version() const {
  const int version = fields.value(1).toInt();
  return version == 0 ? 1 : version;
}

QString CustomTransformerHeader::guid() const {
  QString guid = fields.value(3);
  return guid.remove(QLatin1Char('{')).remove(QLatin1Char('}'));
}

QString CustomTransformerHeader::openingLine(const QStringList& fields) {
  return QORXFromLocal8Bit(kBegin) + fields.join(QLatin1Char(','));
}

bool CustomTransformerHeader::read(const QString& fileName, int wantedVersion, QString& error) {
  *this = CustomTransformerHeader();
  error.clear();
  LineReader lines(fileName, kLongestLine);
  if (!lines.open()) {
    error = lines.errorString();
    return false;
  }
  enum class Where { Outside, Skipped, Wanted, Done };
  Where where = Where::Outside;
  while (where != Where::Done && lines.next()) {
    const QByteArray& line = lines.line();
    if (where == Where::Outside) {
      CustomTransformerHeader opened;
      if (line.startsWith(kBegin))
        opened.fields = splitFields(line);
      if (opened.fields.size() < kNeededFields)
        continue;
      where = wantedVersion >= 0 && opened.version() != wantedVersion ? Where::Skipped : Where::Wanted;
      if (where == Where::Wanted) {
        fields = opened.fields;
        byteOffset = lines.offset();
      }
    } else if (line.startsWith(kEnd)) {
      where = where == Where::Wanted ? Where::Done : Where::Outside;
    } else if (where == Where::Wanted) {
      definitionLines.append(
          QORXFromLocal8Bit(line.startsWith(kDefinitionPrefix) ? line.mid(kDefinitionPrefix.size()) : line));
    }
    endLine = lines.number();
  }
  // A block that the end of the file cuts short is taken for what there is of it.
  if (!lines.failed() && (where == Where::Done || where == Where::Wanted))
    return true;
  error = lines.errorString();
  *this = CustomTransformerHeader();
  return false;
}
