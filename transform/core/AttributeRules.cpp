#include <transform/core/AttributeRules.h>
#include <transform/core/Keywords.h>

ParameterText::ParameterText(const QString& text) {
  int position = 0;
  while (position < text.size()) {
    const int open = text.indexOf(kMacroOpen, position);
    const int close = open < 0 ? -1 : text.indexOf(QLatin1Char(')'), open);
    if (close < 0) {
      break;
    }
    if (open > position) {
      m_pieces.push_back({false, text.mid(position, open - position)});
    }
    const int name = open + kMacroOpen.size();
    m_pieces.push_back({true, text.mid(name, close - name)});
    position = close + 1;
  }
  if (position < text.size()) {
    m_pieces.push_back({false, text.mid(position)});
  }
}

QString ParameterText::onlyParameter() const {
  return m_pieces.size() == 1 && m_pieces.front().isParameter ? m_pieces.front().text : QString();
}

PreservedAttributes PreservedAttributes::parse(const QStringList& tokens) {
  PreservedAttributes preserved;
  for (const QString& token : tokens) {
    if (token == kAllToken) {
      preserved.everything = true;
    } else if (token.startsWith(QLatin1Char('='))) {
      preserved.names.insert(token.mid(1));
    } else if (!token.isEmpty() && token != kNoneToken) {
      const int colon = token.indexOf(QLatin1Char(':'));
      if (colon < 0) {
        preserved.outputs.insert(token);
      } else {
        preserved.inputsOf[token.left(colon)].insert(token.mid(colon + 1));
      }
    }
  }
  return preserved;
}

bool PreservedAttributes::passes(const QString& attribute, const QString& inputTag,
                                 const QString& outputTag) const {
  return names.contains(attribute) || passesAll(inputTag, outputTag);
}

bool PreservedAttributes::passesAll(const QString& inputTag, const QString& outputTag) const {
  if (everything || outputs.contains(outputTag)) {
    return true;
  }
  const auto inputs = inputsOf.constFind(outputTag);
  return inputs != inputsOf.constEnd() && inputs->contains(inputTag);
}

bool AttributeRules::addListAction(const QString& line) {
  const QStringList words = line.split(QLatin1Char(' '), Qt::SkipEmptyParts);
  if (words.size() < 2) {
    return false;
  }
  const QString& verb = words[1];
  ListAction action;
  int listWord = -1;
  int wordCount = 2;
  if (verb == QLatin1String("KEEP")) {
    action.kind = ListAction::Kind::Keep;
  } else if (verb == QLatin1String("DROP")) {
    action.kind = ListAction::Kind::Drop;
  } else if (verb == QLatin1String("COLLECT") && words.size() > 2) {
    action.kind = ListAction::Kind::Collect;
    action.inputTag = words[2];
    listWord = 3;
    wordCount = 4;
  } else if (verb == QLatin1String("EXPLODE")) {
    action.kind = ListAction::Kind::Explode;
    listWord = 2;
    wordCount = 3;
  } else {
    return false;
  }
  if (words.size() != wordCount) {
    return false;
  }
  if (listWord >= 0) {
    QString list = words[listWord];
    if (list.endsWith(kListMark)) {
      list.chop(kListMark.size());
    }
    action.list = ParameterText(list);
    if (action.list.isEmpty()) {
      return false;
    }
    noteParameters(action.list);
  }
  listActions[words[0]].push_back(std::move(action));
  return true;
}

void AttributeRules::addAttribute(const QString& token, const QSet<QString>& outputTags) {
  AddedAttribute attribute;
  QString name = token;
  const int colon = token.indexOf(QLatin1Char(':'));
  if (colon > 0 && outputTags.contains(token.left(colon))) {
    attribute.outputTag = token.left(colon);
    name = token.mid(colon + 1);
  }
  const int mark = name.lastIndexOf(kListMemberMark);
  if (mark > 0) {
    attribute.list = ParameterText(name.left(mark));
    name = name.mid(mark + kListMemberMark.size());
  }
  attribute.name = ParameterText(name);
  if (attribute.name.isEmpty()) {
    return;
  }
  noteParameters(attribute.list);
  noteParameters(attribute.name);
  added.push_back(std::move(attribute));
}

void AttributeRules::noteParameters(const ParameterText& text) {
  for (const ParameterText::Piece& piece : text.pieces()) {
    if (piece.isParameter) {
      parameters.insert(piece.text);
    }
  }
}
