#include <platform/session/ORXString.h>
#include <transform/workspace/XMLDatasetElement.h>

void XMLDatasetElement::getDataset(IORXString& dataset) const {
  ORXAssign(dataset, m_record.dataset);
}
void XMLDatasetElement::getFormat(IORXString& format) const {
  ORXAssign(format, m_record.format);
}
void XMLDatasetElement::getKeyword(IORXString& keyword) const {
  ORXAssign(keyword, m_record.keyword);
}
