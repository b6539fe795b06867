#include <platform/orxparameter/GUIType.h>
#include <platform/session/ORXString.h>
#include <transform/workspace/XMLGlobalParamElement.h>

void XMLGlobalParamElement::getParameterName(IORXString& name) const {
  ORXAssign(name, GUIType::fromGuiLine(m_record.guiLine).getName());
}
void XMLGlobalParamElement::getGuiLine(IORXString& line) const {
  ORXAssign(line, m_record.guiLine);
}
void XMLGlobalParamElement::getDefaultValue(IORXString& value) const {
  ORXAssign(value, m_record.defaultValue);
}
