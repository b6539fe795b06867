#include <transform/text/MessageNumbers.h>
#include <transform/workspace/WorkspaceLossReport.h>
#include <transform/workspace/reading/DocumentMessages.h>
#include <transform/workspace/reading/XORXDOMParser.h>
#include <transform/workspace/records/ElementTable.h>
#include <transform/workspace/writing/LossCollector.h>

namespace messages = orx::messages;

namespace {

WorkspaceLossReport::Kind kindOf(LeftOutContent::Kind content) {
  switch (content) {
    case LeftOutContent::Kind::Comment:
      return WorkspaceLossReport::Kind::Comment;
    case LeftOutContent::Kind::Instruction:
      return WorkspaceLossReport::Kind::Instruction;
    case LeftOutContent::Kind::Declaration:
      return WorkspaceLossReport::Kind::Declaration;
    case LeftOutContent::Kind::Text:
      break;
  }
  return WorkspaceLossReport::Kind::Text;
}

}  // namespace

WorkspaceLossReport::WorkspaceLossReport(const XMLComponentReader& reader) {
  if (reader.getElements().size() > 0)
    LossCollector(reader.getElements(), m_losses).document(0);
  for (const LeftOutContent& entry : reader.getLeftOutContent())
    m_losses.push_back({kindOf(entry.kind), entry.line, QString(), QString(), QString()});
  std::stable_sort(m_losses.begin(), m_losses.end(),
                   [](const Loss& left, const Loss& right) { return left.line < right.line; });
}

long WorkspaceLossReport::Loss::message() const {
  switch (kind) {
    case Kind::Root:
      return messages::kLostRoot;
    case Kind::Constant:
      return messages::kLostConstant;
    case Kind::ReadOnlyAttribute:
      return messages::kReadOnlyAttribute;
    case Kind::UnknownAttribute:
      return messages::kUnknownAttribute;
    case Kind::MalformedValue:
      return messages::kMalformedValue;
    case Kind::UnknownElement:
      return messages::kUnknownElement;
    case Kind::RepeatedElement:
      return messages::kRepeatedElement;
    case Kind::SubDocument:
      return attribute.isEmpty() ? messages::kNamelessSubDocument : messages::kRepeatedSubDocument;
    case Kind::Text:
      return messages::kLostText;
    case Kind::Comment:
      return messages::kLostComment;
    case Kind::Instruction:
      return messages::kLostInstruction;
    case Kind::Declaration:
      return messages::kLostDeclaration;
    case Kind::ChangedValue:
      return messages::kChangedValue;
    case Kind::RawLine:
      return messages::kMovedLine;
  }
  return 0;
}

QString WorkspaceLossReport::Loss::describe() const {
  switch (kind) {
    case Kind::Root:
      return documentText(message(), {element, words::kWorkspace.toQString()});
    case Kind::Constant:
    case Kind::UnknownElement:
    case Kind::RepeatedElement:
      return documentText(message(), {element});
    case Kind::ReadOnlyAttribute:
    case Kind::UnknownAttribute:
      return documentText(message(), {attribute, element});
    case Kind::MalformedValue:
    case Kind::ChangedValue:
      return documentText(message(), {attribute, element, value});
    case Kind::SubDocument:
      return documentText(message(), attribute.isEmpty() ? QStringList() : QStringList(attribute));
    case Kind::RawLine:
      return documentText(message(), {value});
    case Kind::Text:
    case Kind::Comment:
    case Kind::Instruction:
    case Kind::Declaration:
      break;
  }
  return documentText(message());
}
