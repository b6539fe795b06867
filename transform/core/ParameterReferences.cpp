#include <transform/core/Keywords.h>
#include <transform/core/ParameterReferences.h>

namespace {

// The next innermost reference at or behind `from`; false when there is none.
bool findReference(const QString& text, int from, int& begin, int& end) {
  for (int open = text.indexOf(kMacroOpen, from); open >= 0; open = text.indexOf(kMacroOpen, open)) {
    int place = open + kMacroOpen.size();
    while (place < text.size() && text.at(place) != QLatin1Char('$') && text.at(place) != QLatin1Char('(') &&
           text.at(place) != QLatin1Char(')'))
      ++place;
    if (place < text.size() && text.at(place) == QLatin1Char(')')) {
      begin = open;
      end = place + 1;
      return true;
    }
    open = place;
  }
  return false;
}

QString nameOf(const QString& text, int begin, int end) {
  return text.mid(begin + kMacroOpen.size(), end - begin - kMacroOpen.size() - 1);
}

}  // namespace

QString replaceParameterReferences(const QString& text,
                                   const std::function<bool(const QString&, QString&)>& replace) {
  QString replaced;
  int copied = 0;
  int begin = 0;
  int end = 0;
  while (findReference(text, end, begin, end)) {
    QString replacement;
    if (!replace(nameOf(text, begin, end), replacement))
      continue;
    replaced += text.midRef(copied, begin - copied);
    replaced += replacement;
    copied = end;
  }
  return copied == 0 ? text : replaced + text.midRef(copied);
}

bool anyParameterReference(const QString& text, const std::function<bool(const QString&)>& matches) {
  int begin = 0;
  int end = 0;
  while (findReference(text, end, begin, end)) {
    if (matches(nameOf(text, begin, end)))
      return true;
  }
  return false;
}
