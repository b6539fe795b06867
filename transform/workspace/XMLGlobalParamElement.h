// A global parameter for callers without the string library. Holds its own copy of the record.
#pragma once

#include <platform/session/IORXString.h>
#include <transform/workspace/WorkspaceRecords.h>

class ORX_EXPORT XMLGlobalParamElement {
 public:
  explicit XMLGlobalParamElement(const GlobalParameterStruct& record) : m_record(record) {}

  // As the prompt line names it; empty when the line is no prompt line.
  void getParameterName(IORXString& name) const;
  void getGuiLine(IORXString& line) const;
  void getDefaultValue(IORXString& value) const;

 private:
  GlobalParameterStruct m_record;
};
