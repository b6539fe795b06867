// Finds the references "$(NAME)" of a statement, those inside NAME included. Linear in the size of the
// statement.
#pragma once

#include <QString>

#include <vector>

struct MappingFileReference {
  int begin = 0;
  int end = 0;  // behind the closing parenthesis, or where it is missed
  bool isClosed = true;
  bool isDeferred = false;  // "$[NAME]"
  bool isInside = false;    // inside the name of another one

  QString name(const QString& text) const { return text.mid(begin + 2, end - begin - 3); }
};

// In the order of their ends. A "$(" whose name a blank or the end of the text cuts off is not closed.
std::vector<MappingFileReference> mappingFileReferences(const QString& text);

// The text with `filler` in the place of closed references, as long as they are.
QString blankReferences(const QString& text, const std::vector<MappingFileReference>& references,
                        QChar filler = QLatin1Char('x'));
