// Walks over a document and holds it against the tables; the work of WorkspaceLossReport.
#pragma once

#include <transform/workspace/RecordReader.h>
#include <transform/workspace/WorkspaceLossReport.h>

#include <QSet>

class LossCollector {
 public:
  using Element = ElementLines::Element;
  using Kind = WorkspaceLossReport::Kind;

  LossCollector(const ElementLines& lines, std::vector<WorkspaceLossReport::Loss>& losses)
      : m_lines(lines), m_losses(losses) {}

  void document(const Element& root);

 private:
  void sections(const Element& parent, bool isMain);
  bool documentSection(const Element& section);
  bool mainSection(const Element& section);
  void subDocuments(const Element& holder);
  void server(const Element& element);

  template <class Table>
  void section(const Element& section);
  template <class Table>
  void record(const Element& element);
  template <class Table>
  void recordChildren(const Element& element);
  template <class R, class Table>
  bool child(const ChildRule<R, Table>& rule, const Element& element);

  void allAttributes(const Element& element);
  void everything(const Element& holder, Kind kind);
  void report(Kind kind, const Element& element, const QString& attribute = QString(),
              const QString& value = QString());

  const ElementLines& m_lines;
  std::vector<WorkspaceLossReport::Loss>& m_losses;
  std::size_t m_cursor = 0;
  bool m_hasServer = false;
  QSet<QString> m_subDocuments;
};
