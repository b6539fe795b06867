#include <platform/orxparameter/orxparameter.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/core/ValueReferences.h>
#include <transform/text/MacroText.h>

namespace {

// Which forms of brackets close each other.
enum class Form { Plain, Encoded };

struct Mark {
  const QLatin1String& text;
  Form form;
  enum class Kind { Reference, Open, Close } kind;
};

// A longer mark stands before what it begins with.
const Mark kMarks[] = {
    {kValueReference, Form::Plain, Mark::Kind::Reference},
    {kValueReferenceEncoded, Form::Encoded, Mark::Kind::Reference},
    {kValueReferenceWord, Form::Encoded, Mark::Kind::Reference},
    {kEncodedLeftParenthesis, Form::Encoded, Mark::Kind::Open},
    {kEncodedRightParenthesis, Form::Encoded, Mark::Kind::Close},
};
const QLatin1String kLeftParenthesis("(");
const QLatin1String kRightParenthesis(")");
const Mark kLeft{kLeftParenthesis, Form::Plain, Mark::Kind::Open};
const Mark kRight{kRightParenthesis, Form::Plain, Mark::Kind::Close};

const Mark* markAt(const QString& text, int position, ReferenceForms forms) {
  const QChar c = text.at(position);
  if (c == QLatin1Char('('))
    return &kLeft;
  if (c == QLatin1Char(')'))
    return &kRight;
  if (c != QLatin1Char('@') && c != QLatin1Char('<'))
    return nullptr;
  for (const Mark& mark : kMarks) {
    const bool isLetters = forms == ReferenceForms::Plain
                               ? mark.form == Form::Encoded
                               : forms == ReferenceForms::BareAt && &mark.text == &kValueReferenceWord;
    if (!isLetters && text.midRef(position, mark.text.size()) == mark.text)
      return &mark;
  }
  return nullptr;
}

// A name may stand in quotes, which are no part of it.
ValueReference makeReference(int begin, int end, const QString& inside, Form form) {
  static const QString quote = QORXWwjdEncode(QStringLiteral("\""));
  QString word = form == Form::Encoded ? reencodeAroundReferences(inside) : encodeAroundReferences(inside);
  if (word.size() >= 2 * quote.size() && word.startsWith(quote) && word.endsWith(quote))
    word = word.mid(quote.size(), word.size() - 2 * quote.size());
  return {begin, end, QORXWwjdDecode(word), word};
}

// Where the reference ends whose quoted name begins at `position`; -1 when no such name stands there.
int endOfQuotedName(const QString& text, int position, Form form) {
  const QLatin1String quote(form == Form::Encoded ? "<quotationmark>" : "\"");
  if (text.midRef(position, quote.size()) != quote)
    return -1;
  const int closing = text.indexOf(quote, position + quote.size());
  const QLatin1String& bracket = form == Form::Encoded ? kEncodedRightParenthesis : kRightParenthesis;
  const bool isClosed = closing >= 0 && text.midRef(closing + quote.size(), bracket.size()) == bracket;
  return isClosed ? closing + quote.size() + bracket.size() : -1;
}

}  // namespace

ReferenceForms referenceForms(const GUIType& type, const QString& value) {
  // The parts of conditions are encoded whatever the type, and so are formulas.
  if (type.isNull() || value.startsWith(kConditionalPrefix) || type.getType().startsWith(kExpressionType))
    return ReferenceForms::All;
  if (!type.valueIsEncoded())
    return ReferenceForms::Plain;
  return type.mayHoldAttributeReference() ? ReferenceForms::All : ReferenceForms::BareAt;
}

std::vector<ValueReference> valueReferences(const GUIType& type, const QString& value) {
  return valueReferences(value, referenceForms(type, value));
}

std::vector<ValueReference> valueReferences(const QString& text, ReferenceForms forms) {
  std::vector<ValueReference> references;
  if (!beginsValueReference(text, forms))
    return references;
  std::vector<Form> open;
  // The reference that was opened last: an outer one counts no more. Its bracket is the one at this depth.
  std::size_t depth = 0;
  int begin = -1;
  int nameBegin = 0;
  for (int i = 0; i < text.size(); ++i) {
    const Mark* mark = markAt(text, i, forms);
    if (!mark)
      continue;
    const int behind = i + mark->text.size();
    const int end = mark->kind == Mark::Kind::Reference ? endOfQuotedName(text, behind, mark->form) : -1;
    if (end >= 0) {
      const int bracket = mark->form == Form::Encoded ? kEncodedRightParenthesis.size() : 1;
      references.push_back(makeReference(i, end, text.mid(behind, end - bracket - behind), mark->form));
      begin = -1;
      i = end - 1;
      continue;
    }
    if (mark->kind != Mark::Kind::Close) {
      open.push_back(mark->form);
      if (mark->kind == Mark::Kind::Reference) {
        depth = open.size();
        begin = i;
        nameBegin = behind;
      }
    } else if (!open.empty() && open.back() == mark->form) {
      if (begin >= 0 && open.size() == depth) {
        references.push_back(makeReference(begin, behind, text.mid(nameBegin, i - nameBegin), mark->form));
        begin = -1;
      }
      open.pop_back();
    }
    i = behind - 1;
  }
  return references;
}

bool isValueReference(const QString& text, ReferenceForms forms) {
  const std::vector<ValueReference> references = valueReferences(text, forms);
  return references.size() == 1 && references.front().begin == 0 && references.front().end == text.size();
}

bool beginsValueReference(const QString& text, ReferenceForms forms) {
  return text.contains(kValueReference) ||
         (forms != ReferenceForms::Plain && text.contains(kValueReferenceEncoded)) ||
         (forms == ReferenceForms::All && text.contains(kValueReferenceWord));
}

int endOfValueReference(const QString& text, int begin) {
  const int behind = begin + kValueReference.size();
  const int end = endOfQuotedName(text, behind, Form::Plain);
  if (end >= 0)
    return end;
  int depth = 1;
  for (int i = behind; i < text.size(); ++i) {
    depth += text.at(i) == QLatin1Char('(') ? 1 : text.at(i) == QLatin1Char(')') ? -1 : 0;
    if (depth == 0)
      return i + 1;
  }
  return -1;
}
