#include <platform/qorxcore/WordEncoding.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MacroText.h>

#include <algorithm>

namespace {

// Engines expand no deeper than this.
constexpr std::size_t kDeepest = 64;
// Keeps what is noted of a text in proportion to it.
constexpr int kLongestReference = 4096;
constexpr int kLongestName = 1024;

bool endsName(QChar c) {
  return c == QLatin1Char(' ') || c == QLatin1Char('\t') || c == QLatin1Char('\n') ||
         c == QLatin1Char('\r') || c == QLatin1Char('$') || c == QLatin1Char('(') || c == QLatin1Char(')');
}

bool isOutermost(const MacroReference& reference) {
  return reference.isClosed && !reference.isInside;
}

template <class Rewrite>
QString rewriteAround(const QString& text, Rewrite rewrite) {
  QString result;
  int done = 0;
  for (const MacroReference& reference : macroReferences(text)) {
    if (!isOutermost(reference)) {
      continue;
    }
    result += rewrite(text.mid(done, reference.begin - done));
    result += text.midRef(reference.begin, reference.end - reference.begin);
    done = reference.end;
  }
  return result + rewrite(text.mid(done));
}

}  // namespace

std::vector<MacroReference> macroReferences(const QString& text) {
  std::vector<MacroReference> found;
  struct Open {
    int begin;
    bool isDeferred;
    bool hasInner;
  };
  std::vector<Open> open;
  const auto cutOff = [&](int at) {
    for (const Open& each : open) {
      if (each.isDeferred || each.begin == open.front().begin) {
        found.push_back({each.begin, at, false, each.isDeferred});
      }
    }
    open.clear();
  };
  int i = text.indexOf(QLatin1Char('$'));
  while (i >= 0 && i < text.size()) {
    const QChar c = text.at(i);
    const QChar next = i + 1 < text.size() ? text.at(i + 1) : QChar();
    const bool opens = c == QLatin1Char('$') && (next == QLatin1Char('(') || next == QLatin1Char('['));
    const bool closes =
        !opens && !open.empty() && c == (open.back().isDeferred ? QLatin1Char(']') : QLatin1Char(')'));
    if (opens) {
      if (open.size() == kDeepest) {
        cutOff(i);
      }
      if (!open.empty()) {
        open.back().hasInner = true;
      }
      open.push_back({i, next == QLatin1Char('['), false});
      ++i;
    } else if (closes && i > open.back().begin + 2) {
      const Open closed = open.back();
      open.pop_back();
      for (auto inner = found.rbegin(); inner != found.rend() && inner->begin > closed.begin; ++inner) {
        inner->isInside = true;
      }
      found.push_back({closed.begin, i + 1, true, closed.isDeferred, false, closed.hasInner});
    } else if (closes &&
               std::none_of(open.begin(), open.end(), [](const Open& each) { return each.isDeferred; })) {
      open.clear();
    } else if (closes) {
      // Brackets that are written as others are no text any more.
      cutOff(i);
    } else if (!open.empty() && (endsName(c) || i - open.front().begin > kLongestReference)) {
      cutOff(i);
    }
    ++i;
    if (open.empty()) {
      i = text.indexOf(QLatin1Char('$'), i);
    }
  }
  cutOff(text.size());
  return found;
}

QString blankReferences(const QString& text, const std::vector<MacroReference>& references, QChar filler) {
  QString result = text;
  for (const MacroReference& reference : references) {
    if (isOutermost(reference) && !reference.isDeferred) {
      std::fill(result.begin() + reference.begin, result.begin() + reference.end, filler);
    }
  }
  return result;
}

bool closesDeferredReferences(const QString& text) {
  const std::vector<MacroReference> references = macroReferences(text);
  return MFBuffer::closesDeferredMacros(text) &&
         std::all_of(references.begin(), references.end(),
                     [](const auto& each) { return each.isClosed || !each.isDeferred; });
}

bool beginsMacroReference(const QString& text) {
  return text.contains(QLatin1String("$(")) || text.contains(QLatin1String("$["));
}

QString encodeAroundReferences(const QString& text) {
  return rewriteAround(text, [](const QString& part) { return QORXWwjdEncode(part); });
}

QString reencodeAroundReferences(const QString& encoded) {
  return rewriteAround(encoded, [](const QString& part) { return QORXWwjdEncode(QORXWwjdDecode(part)); });
}

QString withoutReferences(const QString& text) {
  QString result;
  int done = 0;
  for (const MacroReference& reference : macroReferences(text)) {
    if (isOutermost(reference)) {
      result += text.midRef(done, reference.begin - done);
      result += QLatin1Char('x');
      done = reference.end;
    }
  }
  return result + text.midRef(done);
}

bool isMacroName(const QString& name) {
  // A quote at the beginning would make it a quoted word.
  return !name.isEmpty() && name.size() <= kLongestName && !name.startsWith(QLatin1Char('"')) &&
         std::none_of(name.begin(), name.end(), [](QChar c) {
           return c.isSpace() || c == QLatin1Char('$') || c == QLatin1Char('(') || c == QLatin1Char(')');
         });
}
