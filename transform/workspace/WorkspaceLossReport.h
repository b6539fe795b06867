// What of a document that was read would be gone if it were written again, each with its line in the file.
//
// Reported are: constants, attributes that are only read (unless they hold what their absence means),
// attributes and elements that no table knows, values that are malformed and so read as their default,
// comments, processing instructions and text, and sub-documents that have no name or the name of an earlier
// one.
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
    UnknownElement,
    RepeatedElement,
    SubDocument,
    Text,
    Comment,
    Instruction
  };
  struct Loss {
    Kind kind;
    int line;
    QString element;    // empty for text, comments and instructions
    QString attribute;  // its name, or the name of the sub-document
    QString value;

    // One sentence for the user, without the place.
    QString describe() const;
  };

  // Reads the reader's document; the reader is not kept.
  explicit WorkspaceLossReport(const XMLComponentReader& reader);

  bool isEmpty() const { return m_losses.empty(); }
  // In the order of lines.
  const std::vector<Loss>& losses() const { return m_losses; }

 private:
  std::vector<Loss> m_losses;
};
