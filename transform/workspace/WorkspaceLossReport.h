// What of a document that was read would be gone if it were written again, each with its line in the file.
//
// Reported are: constants, attributes that are only read (unless they hold what their absence means),
// attributes and elements that no table knows, values that are malformed and so read as their default,
// comments, processing instructions and text, what the XML declaration says beside version 1.0 and encoding,
// values that another attribute decides, and sub-documents that have no name or the name of an earlier one.
// The lines around the XML are no part of the reader's document; RawLines tells of those.
#pragma once

#include <transform/workspace/XMLComponentReader.h>

class ORX_EXPORT WorkspaceLossReport {
 public:
  enum class Kind {
    Root,
    Constant,
    ReadOnlyAttribute,
    UnknownAttribute,
    MalformedValue,
    ChangedValue,
    UnknownElement,
    RepeatedElement,
    SubDocument,
    Text,
    Comment,
    Instruction,
    Declaration,
    RawLine
  };
  struct Loss {
    Kind kind;
    int line;
    QString element;    // empty for text, comments and instructions
    QString attribute;  // its name, or the name of the sub-document
    QString value;      // as it stands; of a changed value, as it would be written; of a raw line, its text

    // One sentence for the user, without the place, and the number of its message.
    QString describe() const;
    long message() const;
  };

  // Reads the reader's document; the reader is not kept.
  explicit WorkspaceLossReport(const XMLComponentReader& reader);

  bool isEmpty() const { return m_losses.empty(); }
  // In the order of lines.
  const std::vector<Loss>& losses() const { return m_losses; }

 private:
  std::vector<Loss> m_losses;
};
