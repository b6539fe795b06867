// The macros that the statements of a mapping file set, and the references to them.
#pragma once

#include <transform/text/MacroText.h>

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>

#include <vector>

class MappingFileReport;
struct MappingFileStatement;

class MappingFileMacros {
 public:
  enum class Use {
    Now,      // expanded where it stands
    Later,    // in the value of a macro, which is looked at again whenever the macro is used
    InBlock,  // inside a definition, which is read where it is included
  };

  void set(const QString& name, const QString& value, int line);
  // A script may set every macro whose name it holds.
  void mention(const QString& script);
  // The prefix macro of the definition being read; empty outside of definitions.
  void setPrefix(const QString& name) { m_prefix = name; }
  // From here on macros may come from another file.
  void noteInclude() { m_hasInclude = true; }

  // Notes the references of the statement from `from` up to `to`, and reports those that are none. `block` is
  // the definition that they stand in, or -1.
  void refer(const MappingFileStatement& statement, const std::vector<MacroReference>& references, int from,
             int to, Use use, int block, MappingFileReport& report);
  // That the statement at `line` needs the macro.
  void need(const QString& name, int line, Use use, int block);

  // How much is remembered.
  std::size_t size() const {
    return static_cast<std::size_t>(m_lines.size() + m_mentioned.size()) + m_pending.size();
  }
  // Reports what leads nowhere. Of the blocks in `openBlocks` only the users know the macros.
  void finish(const QSet<int>& openBlocks, MappingFileReport& report) const;

 private:
  struct Pending {
    QString name;
    QString expanded;  // with the macros inside the name, where they are known
    int line;
    Use use;
    int block;
  };

  bool isKnown(const QString& name) const;
  int lineOf(const Pending& reference) const;
  QString expanded(const QString& name) const;

  QHash<QString, int> m_lines;  // of the first statement that sets the macro
  QStringList m_names;          // the same, in their order
  QHash<QString, QString> m_values;
  QSet<QString> m_mentioned;
  QString m_prefix;
  bool m_hasInclude = false;
  std::vector<Pending> m_pending;
};
