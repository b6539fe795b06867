// Walks over a document and holds it against the tables; the work of WorkspaceLossReport.
#pragma once

#include <transform/workspace/WorkspaceLossReport.h>
#include <transform/workspace/records/RecordReader.h>

#include <QSet>

class LossCollector {
 public:
  // A place in the table of elements.
  using Place = std::size_t;
  using Kind = WorkspaceLossReport::Kind;

  LossCollector(const ElementTable& elements, std::vector<WorkspaceLossReport::Loss>& losses)
      : m_elements(elements), m_losses(losses) {}

  void document(Place root);

 private:
  void sections(Place parent, bool isMain);
  bool documentSection(Place section);
  bool mainSection(Place section);
  void subDocuments(Place holder);
  void server(Place element);

  template <class Table>
  void section(Place section);
  template <class Table>
  void record(Place element);
  template <class Table>
  void recordChildren(Place element);
  template <class R, class Table>
  bool child(const ChildRule<R, Table>& rule, Place element);

  bool isNamed(Place element, const Word& name) const;
  void allAttributes(Place element);
  void everything(Place holder, Kind kind);
  void report(Kind kind, Place element, const QString& attribute = QString(),
              const QString& value = QString());

  const ElementTable& m_elements;
  std::vector<WorkspaceLossReport::Loss>& m_losses;
  bool m_hasServer = false;
  QSet<QString> m_subDocuments;
};
