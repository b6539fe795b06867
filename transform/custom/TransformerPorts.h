// Which ports of a transformer its record and the links of its document mean.
//
// A port is known by its tag, else by the alias of an input tag, else by the name that a tag had in the
// version that the record is of. Where a name is missing, a number counts through the ports that the record
// lists, or through the tags when it lists none.
#pragma once

#include <platform/Export.h>

#include <QHash>
#include <QString>
#include <QStringList>

class TransformerCfg;
struct TransformerStruct;

class ORX_EXPORT TransformerPorts {
 public:
  TransformerPorts() = default;
  // The configuration is asked at once and not kept.
  TransformerPorts(const TransformerStruct& record, const TransformerCfg& cfg);

  // The tag; the null text when there is no such port.
  QString input(unsigned number, const QString& name) const { return m_inputs.find(number, name); }
  QString output(unsigned number, const QString& name) const { return m_outputs.find(number, name); }

  // The attributes that a user added to what leaves the outputs, by tag; one that names no output of the
  // record stands at all of them.
  QHash<QString, QStringList> exposedAttributes(const TransformerStruct& record) const;

 private:
  struct Side {
    QString find(unsigned number, const QString& name) const;
    const QStringList& counted() const { return listed.isEmpty() ? tags : listed; }

    QStringList tags;
    QStringList listed;             // by the record
    QHash<QString, QString> names;  // whatever a tag is called, to the tag
  };

  static void addNames(Side& side, const QHash<QString, QString>& aliases,
                       const QHash<QString, QString>& renamed);

  Side m_inputs;
  Side m_outputs;
};
