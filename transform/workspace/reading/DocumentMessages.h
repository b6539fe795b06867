// The messages of workspace documents, by number.
#pragma once

#include <QStringList>

namespace document_messages {

constexpr long kUndecodable = 370760;
constexpr long kValueTooLong = 370761;
constexpr long kNestedTooDeep = 370762;
constexpr long kTooManyAttributes = 370763;
constexpr long kDocumentType = 370764;
constexpr long kUnknownEncoding = 370765;
constexpr long kContactSupport = 370766;
constexpr long kNoWorkspaceFile = 370767;

// What would be lost if a document were written again.
constexpr long kLostRoot = 370768;
constexpr long kLostConstant = 370769;
constexpr long kReadOnlyAttribute = 370770;
constexpr long kUnknownAttribute = 370771;
constexpr long kMalformedValue = 370772;
constexpr long kUnknownElement = 370773;
constexpr long kRepeatedElement = 370774;
constexpr long kNamelessSubDocument = 370775;
constexpr long kRepeatedSubDocument = 370776;
constexpr long kLostText = 370777;
constexpr long kLostComment = 370778;
constexpr long kLostInstruction = 370779;
constexpr long kLostDeclaration = 371300;
constexpr long kChangedValue = 371301;
constexpr long kMovedLine = 371302;

}  // namespace document_messages

// The text of one of them. Never empty: without the message files, under a wrong home, it is the number and
// the arguments.
QString documentText(long number, const QStringList& arguments = QStringList());
