// A dataset for callers without the string library. Holds its own copy of the record.
#pragma once

#include <platform/session/IORXString.h>
#include <transform/workspace/WorkspaceRecords.h>

class ORX_EXPORT XMLDatasetElement {
 public:
  explicit XMLDatasetElement(const DatasetStruct& record) : m_record(record) {}

  // Path or name.
  void getDataset(IORXString& dataset) const;
  void getFormat(IORXString& format) const;
  void getKeyword(IORXString& keyword) const;
  bool isReader() const { return m_record.isSource; }

 private:
  DatasetStruct m_record;
};
