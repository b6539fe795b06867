#include <transform/core/Formula.h>
#include <transform/core/Keywords.h>
#include <transform/core/ValueReferences.h>
#include <transform/findings/Refusal.h>
#include <transform/text/MessageNumbers.h>

#include <algorithm>

namespace messages = orx::messages;

namespace {

constexpr int kLongestQuote = 40;

bool isNameCharacter(QChar c) {
  return c.isLetterOrNumber() || c == QLatin1Char('_');
}

bool isWord(const QString& text, const char* word) {
  return text.compare(QLatin1String(word), Qt::CaseInsensitive) == 0;
}

int skip(const QString& text, int position, bool (*belongs)(QChar)) {
  while (position < text.size() && belongs(text.at(position))) {
    ++position;
  }
  return position;
}

bool isDigit(QChar c) {
  return c >= QLatin1Char('0') && c <= QLatin1Char('9');
}

int numberEnd(const QString& text, int position) {
  int end = skip(text, position, isDigit);
  if (end < text.size() && text.at(end) == QLatin1Char('.')) {
    const int point = end;
    end = skip(text, point + 1, isDigit);
    if (end == point + 1) {
      return -1;
    }
  }
  if (end < text.size() && text.at(end).toLower() == QLatin1Char('e')) {
    int digits = end + 1;
    if (digits < text.size() &&
        (text.at(digits) == QLatin1Char('-') || text.at(digits) == QLatin1Char('+'))) {
      ++digits;
    }
    const int exponentEnd = skip(text, digits, isDigit);
    end = exponentEnd > digits ? exponentEnd : end;
  }
  return end < text.size() && isNameCharacter(text.at(end)) ? -1 : end;
}

// Behind the closing quote; quotes inside are doubled.
int textEnd(const QString& text, int position) {
  for (int i = position + 1; i < text.size(); ++i) {
    if (text.at(i) != QLatin1Char('"')) {
      continue;
    }
    if (i + 1 == text.size() || text.at(i + 1) != QLatin1Char('"')) {
      return i + 1;
    }
    ++i;
  }
  return -1;
}

int operatorSize(const QString& text, int position) {
  static const QLatin1String operators[] = {QLatin1String("!="), QLatin1String("<="), QLatin1String(">="),
                                            QLatin1String("="),  QLatin1String("<"),  QLatin1String(">"),
                                            QLatin1String("+"),  QLatin1String("-"),  QLatin1String("*"),
                                            QLatin1String("/"),  QLatin1String("%")};
  const auto found = std::find_if(std::begin(operators), std::end(operators), [&](QLatin1String candidate) {
    return text.midRef(position, candidate.size()) == candidate;
  });
  return found == std::end(operators) ? 0 : found->size();
}

QString quoted(const QString& piece) {
  return piece.size() > kLongestQuote ? piece.left(kLongestQuote) + QChar(0x2026) : piece;
}

// A text, which stands in quotes, that does not read as a number.
bool isNoNumber(const Formula::Token& token) {
  bool isNumber = false;
  token.text.mid(1, token.text.size() - 2).toDouble(&isNumber);
  return token.kind == Formula::Kind::Text && !isNumber;
}

bool calculates(const Formula::Token& token) {
  static const QString kSigns = QStringLiteral("+-*/%");
  return (token.kind == Formula::Kind::Operator || token.kind == Formula::Kind::Sign) &&
         kSigns.contains(token.text);
}

// What stands on both sides of an operand, brackets around it alone aside; null for nothing.
std::pair<const Formula::Token*, const Formula::Token*> aroundBrackets(
    const std::vector<Formula::Token>& tokens, std::size_t operand) {
  std::size_t before = operand;
  std::size_t behind = operand + 1;
  while (before > 0 && behind < tokens.size() && tokens[before - 1].kind == Formula::Kind::Open &&
         tokens[behind].kind == Formula::Kind::Close) {
    --before;
    ++behind;
  }
  return {before > 0 ? &tokens[before - 1] : nullptr, behind < tokens.size() ? &tokens[behind] : nullptr};
}

}  // namespace

Formula::Formula(const QString& text) : m_text(text) {
  parse();
  if (isValid()) {
    judgeOperands();
  }
}

bool Formula::take(int& position, bool wantsOperand, Token& token) const {
  const int start = position;
  const QChar c = m_text.at(start);
  const auto finish = [&](Kind kind, int end) {
    if (end <= start) {
      return false;
    }
    token = {kind, m_text.mid(start, end - start), start};
    position = end;
    return true;
  };
  if (c == QLatin1Char('(')) {
    return wantsOperand && finish(Kind::Open, start + 1);
  }
  if (c == QLatin1Char(')')) {
    return finish(Kind::Close, start + 1);
  }
  if (c == QLatin1Char(',')) {
    return !wantsOperand && finish(Kind::Comma, start + 1);
  }
  const int nameEnd = skip(m_text, start, isNameCharacter);
  const QString name = m_text.mid(start, nameEnd - start);
  const bool isJoin = isWord(name, "and") || isWord(name, "or");
  if (!wantsOperand) {
    return finish(Kind::Operator, isJoin ? nameEnd : start + operatorSize(m_text, start));
  }
  if (c == QLatin1Char('+') || c == QLatin1Char('-')) {
    return finish(Kind::Sign, start + 1);
  }
  if (c == QLatin1Char('"')) {
    const int end = textEnd(m_text, start);
    // A reference in a text is one all the same where the formula is written.
    return valueReferences(m_text.mid(start, end - start), ReferenceForms::Plain).empty() &&
           finish(Kind::Text, end);
  }
  if (m_text.midRef(start, kValueReference.size()) == kValueReference) {
    const int end = endOfValueReference(m_text, start);
    // Where one stands inside, the outer one is no reference.
    return end != start + kValueReference.size() + 1 &&
           isValueReference(m_text.mid(start, end - start), ReferenceForms::Plain) &&
           finish(Kind::Attribute, end);
  }
  if (isDigit(c) || c == QLatin1Char('.')) {
    return finish(Kind::Number, numberEnd(m_text, start));
  }
  if (isWord(name, "not")) {
    return finish(Kind::Sign, nameEnd);
  }
  const int open = skip(m_text, nameEnd, [](QChar blank) { return blank.isSpace(); });
  const bool isCall =
      !name.isEmpty() && !isJoin && open < m_text.size() && m_text.at(open) == QLatin1Char('(');
  return isCall && finish(Kind::Function, open + 1);
}

void Formula::parse() {
  std::vector<bool> open;  // for each open bracket whether it is a call's
  bool wantsOperand = true;
  int position = 0;
  while (true) {
    position = skip(m_text, position, [](QChar blank) { return blank.isSpace(); });
    if (position == m_text.size()) {
      break;
    }
    Token token;
    const int start = position;
    bool isUnderstood = take(position, wantsOperand, token);
    if (isUnderstood && token.kind == Kind::Close) {
      const bool closesEmptyCall =
          wantsOperand && !m_tokens.empty() && m_tokens.back().kind == Kind::Function;
      isUnderstood = !open.empty() && (!wantsOperand || closesEmptyCall);
    } else if (isUnderstood && token.kind == Kind::Comma) {
      isUnderstood = !open.empty() && open.back();
    }
    if (!isUnderstood) {
      m_fault = start;
      return;
    }
    switch (token.kind) {
      case Kind::Open:
      case Kind::Function:
        open.push_back(token.kind == Kind::Function);
        break;
      case Kind::Close:
        open.pop_back();
        wantsOperand = false;
        break;
      case Kind::Operator:
      case Kind::Comma:
        wantsOperand = true;
        break;
      case Kind::Sign:
        break;
      default:
        wantsOperand = false;
    }
    m_tokens.push_back(std::move(token));
  }
  if (wantsOperand || !open.empty()) {
    m_fault = m_text.size();
  }
}

void Formula::judgeOperands() {
  for (std::size_t i = 0; i < m_tokens.size(); ++i) {
    const Token& token = m_tokens[i];
    const bool dividesByNothing =
        token.kind == Kind::Number && token.text.toDouble() == 0 && i > 0 &&
        (m_tokens[i - 1].text == QLatin1String("/") || m_tokens[i - 1].text == QLatin1String("%"));
    if (!dividesByNothing && !isNoNumber(token)) {
      continue;
    }
    const auto [left, right] = aroundBrackets(m_tokens, i);
    const bool isOperand = (left && calculates(*left)) || (right && calculates(*right));
    if (dividesByNothing || isOperand) {
      m_fault = token.position;
      m_noNumber = token.text;
      return;
    }
  }
}

bool Formula::refuseNumber(QString& message, const QString& piece) const {
  return orx::refuse(message, messages::kNeverNumber, {quoted(piece)});
}

bool Formula::mayGiveNumber(QString& message) const {
  for (std::size_t i = 0; i < m_tokens.size(); ++i) {
    if (!isNoNumber(m_tokens[i])) {
      continue;
    }
    const auto [left, right] = aroundBrackets(m_tokens, i);
    if (!left && !right) {
      return refuseNumber(message, m_tokens[i].text);
    }
  }
  return true;
}

bool Formula::refuse(QString& message) const {
  if (!m_noNumber.isEmpty()) {
    return refuseNumber(message, m_noNumber);
  }
  const QString rest = m_text.mid(m_fault);
  if (rest.isEmpty()) {
    return orx::refuse(message, messages::kIncomplete);
  }
  return orx::refuse(message, messages::kNotUnderstood, {quoted(rest)});
}

QString Formula::withOwnOperators(const QString& text) {
  struct Foreign {
    QLatin1String theirs;
    QLatin1String ours;
  };
  // "!=" is one of ours and comes before what it begins with.
  static const Foreign foreign[] = {
      {QLatin1String("=="), QLatin1String("=")},     {QLatin1String("<>"), QLatin1String("!=")},
      {QLatin1String("&&"), QLatin1String(" and ")}, {QLatin1String("||"), QLatin1String(" or ")},
      {QLatin1String("!="), QLatin1String("!=")},    {QLatin1String("!"), QLatin1String(" not ")}};
  QString result;
  int position = 0;
  while (position < text.size()) {
    int end = position;
    if (text.at(position) == QLatin1Char('"')) {
      end = textEnd(text, position);
    } else if (text.midRef(position, kValueReference.size()) == kValueReference) {
      end = endOfValueReference(text, position);
    }
    if (end < 0) {
      break;
    }
    if (end > position) {
      result += text.midRef(position, end - position);
      position = end;
      continue;
    }
    const auto* found = std::find_if(std::begin(foreign), std::end(foreign), [&](const Foreign& candidate) {
      return text.midRef(position, candidate.theirs.size()) == candidate.theirs;
    });
    if (found == std::end(foreign)) {
      result += text.at(position++);
    } else {
      result += found->ours;
      position += found->theirs.size();
    }
  }
  return result + text.midRef(position);
}
