#include <platform/qorxcore/WordEncoding.h>
#include <transform/text/MacroText.h>

#include <algorithm>
#include <cstring>

namespace {

bool canStandInName(QChar c) {
  const ushort code = c.unicode();
  if (code >= 0x80) {
    return code > 0xa0 && !c.isSpace();
  }
  return c.isLetterOrNumber() || (code != 0 && std::strchr("-_.:+*=!?~^|#", code) != nullptr);
}

template <class Rewrite>
QString rewriteAround(const QString& text, Rewrite rewrite) {
  const auto references = macroReferences(text);
  if (references.empty()) {
    return rewrite(text);
  }
  QString result;
  int done = 0;
  for (const auto& [begin, end] : references) {
    result += rewrite(text.mid(done, begin - done));
    result += text.midRef(begin, end - begin);
    done = end;
  }
  result += rewrite(text.mid(done));
  return result;
}

}  // namespace

std::vector<std::pair<int, int>> macroReferences(const QString& text) {
  std::vector<std::pair<int, int>> references;
  struct Open {
    int begin;
    QChar closer;
  };
  std::vector<Open> open;
  for (int i = text.indexOf(QLatin1Char('$')); i >= 0 && i < text.size(); ++i) {
    const QChar c = text.at(i);
    const QChar next = i + 1 < text.size() ? text.at(i + 1) : QChar();
    if (c == QLatin1Char('$') && (next == QLatin1Char('(') || next == QLatin1Char('['))) {
      open.push_back({i, next == QLatin1Char('(') ? QLatin1Char(')') : QLatin1Char(']')});
      ++i;
    } else if (!open.empty() && c == open.back().closer && i > open.back().begin + 2) {
      const int begin = open.back().begin;
      open.pop_back();
      while (!references.empty() && references.back().first > begin) {
        references.pop_back();
      }
      references.emplace_back(begin, i + 1);
    } else if (!canStandInName(c)) {
      open.clear();
    }
    if (open.empty()) {
      const int dollar = text.indexOf(QLatin1Char('$'), i + 1);
      if (dollar < 0) {
        break;
      }
      i = dollar - 1;
    }
  }
  return references;
}

QString encodeAroundReferences(const QString& text) {
  return rewriteAround(text, [](const QString& part) { return QORXWwjdEncode(part); });
}

QString reencodeAroundReferences(const QString& encoded) {
  return rewriteAround(encoded, [](const QString& part) { return QORXWwjdEncode(QORXWwjdDecode(part)); });
}

QString withoutReferences(const QString& text) {
  const auto references = macroReferences(text);
  QString result;
  int done = 0;
  for (const auto& [begin, end] : references) {
    result += text.midRef(done, begin - done);
    result += QLatin1Char('x');
    done = end;
  }
  return references.empty() ? text : result + text.midRef(done);
}

bool isMacroName(const QString& name) {
  return !name.isEmpty() && std::none_of(name.begin(), name.end(), [](QChar c) {
    return c.isSpace() || c == QLatin1Char('$') || c == QLatin1Char('(') || c == QLatin1Char(')');
  });
}
