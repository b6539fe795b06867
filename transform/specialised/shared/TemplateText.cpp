#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/specialised/shared/TemplateText.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QXmlStreamReader>

#include <algorithm>
#include <vector>

namespace {

const QLatin1String kTemplateReference("@Template(");
// May stand in place of a text and of a JSON value.
const QLatin1Char kJsonPlaceholder('0');
const QLatin1Char kXmlPlaceholder('x');

// For each opening bracket the place of the one that closes it; -1 elsewhere.
std::vector<int> closingBrackets(const QString& text) {
  std::vector<int> closing(static_cast<std::size_t>(text.size()), -1);
  std::vector<int> open;
  for (int i = 0; i < text.size(); ++i) {
    if (text.at(i) == QLatin1Char('(')) {
      open.push_back(i);
    } else if (text.at(i) == QLatin1Char(')') && !open.empty()) {
      closing[static_cast<std::size_t>(open.back())] = i;
      open.pop_back();
    }
  }
  return closing;
}

int lineAt(const QByteArray& bytes, int offset) {
  return 1 +
         static_cast<int>(std::count(bytes.begin(), bytes.begin() + std::min(offset, bytes.size()), '\n'));
}

}  // namespace

TemplateText::TemplateText(const QString& encoded, Language language) : m_language(language) {
  const QString text = QORXWwjdDecode(encoded);
  const std::vector<int> closing = closingBrackets(text);
  const QLatin1Char placeholder = language == Language::Json ? kJsonPlaceholder : kXmlPlaceholder;
  for (int position = 0; position < text.size(); ++position) {
    int end = -1;
    for (const QLatin1String mark : {kTemplateReference, kValueReference, kMacroOpen}) {
      if (text.midRef(position, mark.size()) == mark) {
        const int name = position + mark.size();
        end = closing[static_cast<std::size_t>(name - 1)];
        if (end >= 0 && mark == kTemplateReference) {
          m_inserted.append(text.mid(name, end - name));
        }
      }
    }
    m_text += end < 0 ? text.at(position) : QChar(placeholder);
    position = std::max(position, end);
  }
}

bool TemplateText::isWellFormed(Extent extent, int& line) const {
  return m_language == Language::Json ? isWellFormedJson(line) : isWellFormedXml(extent, line);
}

bool TemplateText::isWellFormedXml(Extent extent, int& line) const {
  QXmlStreamReader reader(extent == Extent::Fragment ? QLatin1String("<x>") + m_text + QLatin1String("</x>")
                                                     : m_text);
  // Prefixes may be declared where the text goes.
  reader.setNamespaceProcessing(false);
  while (!reader.atEnd()) {
    if (reader.readNext() == QXmlStreamReader::DTD) {
      break;
    }
  }
  line = static_cast<int>(reader.lineNumber());
  return reader.atEnd() && !reader.hasError();
}

bool TemplateText::isWellFormedJson(int& line) const {
  // A single value of any kind; the brackets make it a document.
  const QByteArray bytes = '[' + m_text.toUtf8() + ']';
  QJsonParseError error{};
  const QJsonDocument document = QJsonDocument::fromJson(bytes, &error);
  line = lineAt(bytes, error.error == QJsonParseError::NoError ? bytes.size() : error.offset);
  return error.error == QJsonParseError::NoError && document.array().size() == 1;
}
