// The list that a record keeps its child records in: a QVector, copied when it is changed.
#pragma once

#include <QVector>

template <class T>
class RecordList : public QVector<T> {
 public:
  using QVector<T>::QVector;

  RecordList() = default;
  RecordList(const RecordList&) = default;
  RecordList(RecordList&&) noexcept = default;
  ~RecordList() = default;
  // GCC takes the inlined copy assignment of a QVector for a null dereference.
  RecordList& operator=(const RecordList& other) {
    RecordList copy(other);
    this->swap(copy);
    return *this;
  }
  RecordList& operator=(RecordList&&) noexcept = default;
};
