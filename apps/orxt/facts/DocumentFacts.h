// What the records of a document tell only when they are put together.
#pragma once

#include <transform/workspace/IXMLComponentReader.h>

#include <QString>

#include <set>
#include <vector>

// The sub-documents that can be told apart: without those that have no name, or the name of an earlier one.
QStringList subDocuments(const IXMLComponentReader& reader);

// The transformers of one type; instances of custom transformers are told apart by the sub-document they
// name.
struct TransformerCount {
  QString type;
  QString subDocument;
  int count = 0;
  int disabled = 0;
  std::set<int> versions;
};

// By type, then sub-document.
std::vector<TransformerCount> countTransformers(const IXMLComponentReader& reader, const QString& document);

// A global parameter as its prompt line describes it. Of a line that is no prompt line only value and line
// are known.
struct ParameterFacts {
  QString name;
  QString type;
  QString prompt;
  bool isOptional = false;
  bool isPassword = false;
  QString value;  // the default, as stored; empty for a password
  QString shown;  // the default as a person reads it
  int line = 0;
};

ParameterFacts describe(const GlobalParameterStruct& record);
