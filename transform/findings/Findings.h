// What was found wrong with one file, in the order in which it was found.
#pragma once

#include <platform/Export.h>
#include <transform/findings/Finding.h>

#include <QString>
#include <QStringList>

#include <vector>

namespace orx {

class ORX_EXPORT Findings {
 public:
  explicit Findings(const QString& file) : m_file(file) {}

  const QString& file() const { return m_file; }
  // The text is the rule's message in the current language with `arguments` (at most five) filled in.
  // `remark` is a further sentence.
  void report(Rule rule, int line, const QString& node, const QStringList& arguments = QStringList(),
              const QString& remark = QString());
  // With another message than the rule's own.
  void reportAs(Rule rule, long message, int line, const QString& node,
                const QStringList& arguments = QStringList());
  // With a text that another part of the system has put together.
  void reportText(Rule rule, int line, const QString& node, const QString& text, long message = 0);
  // About one parameter of the node, with a text made from the message.
  void reportParameter(Rule rule, long message, int line, const QString& node, const QString& parameter,
                       const QString& text);
  // The parameter's value cannot be written, for the reason given.
  void reportUnwritable(int line, const QString& node, const QString& parameter, const QString& reason);
  // As it stands, but for the severity, which is the rule's, and the file, which is this one where it has
  // none.
  void add(Finding finding);

  // What was judged already: as it stands, its severity included.
  void take(const std::vector<Finding>& judged);

  bool hasErrors() const { return m_errors > 0; }
  // Whether anything was found that no setting can make less than an error.
  bool forbidsWriting() const { return m_forbidsWriting; }
  const std::vector<Finding>& all() const { return m_all; }

 private:
  QString m_file;
  std::vector<Finding> m_all;
  int m_errors = 0;
  bool m_forbidsWriting = false;
};

}  // namespace orx
