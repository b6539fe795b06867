#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/ConfiguredDefinition.h>

#include <QSet>

TagList TagList::parse(const QStringList& tokens) {
  TagList list;
  QSet<QString> seen;
  for (const QString& token : tokens) {
    const int first = token.indexOf(QLatin1Char(':'));
    const QString tag = token.left(first);
    if (tag.isEmpty() || seen.contains(tag)) {
      continue;
    }
    seen.insert(tag);
    list.tags.append(tag);
    if (first < 0) {
      continue;
    }
    const int second = token.indexOf(QLatin1Char(':'), first + 1);
    const QString alias = token.mid(first + 1, second < 0 ? -1 : second - first - 1);
    if (!alias.isEmpty()) {
      list.aliases.insert(tag, alias);
    }
    if (second >= 0 && second + 1 < token.size()) {
      list.shownNames.insert(tag, QORXWwjdDecode(token.mid(second + 1)));
    }
  }
  return list;
}

QStringList ConfiguredDefinition::tagsOf(const QString& category) {
  QStringList tags;
  for (const QString& piece : category.split(QLatin1Char(','))) {
    const QString tag = piece.trimmed();
    if (!tag.isEmpty()) {
      tags.append(tag);
    }
  }
  return tags;
}
