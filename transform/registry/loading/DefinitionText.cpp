#include <transform/registry/loading/DefinitionKeywords.h>
#include <transform/registry/loading/DefinitionText.h>

QStringList textsOf(const std::vector<DefinitionLine>& lines) {
  QStringList result;
  result.reserve(static_cast<int>(lines.size()));
  for (const DefinitionLine& line : lines) {
    result.append(line.text);
  }
  return result;
}

int DefinitionText::firstLine() const {
  int first = 0;
  for (const auto* lines : {&header, &templateLines, &description, &tooltip, &changeLog}) {
    if (!lines->empty() && (first == 0 || lines->front().number < first)) {
      first = lines->front().number;
    }
  }
  return first;
}

bool readCategoryText(DefinitionLines& lines, std::vector<CategoryText>& categories) {
  CategoryText category{lines.behind(kCategoryDescriptionStart), {}, lines.number()};
  const bool isClosed = lines.readBlock(kCategoryDescriptionEnd, &category.lines);
  categories.push_back(std::move(category));
  return isClosed;
}
