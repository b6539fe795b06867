// The definition of one embedded custom transformer: the mapping-file text of its inside, as a block of
// comments that every instance includes.
//
// The text serves all instances: every name of a transformer and of a feature type begins with the prefix
// macro, and published parameters are read as "$($(PREFIX)_NAME)".
#pragma once

#include <transform/core/TransformerCfgListener.h>
#include <transform/custom/SubDocNetworkObj.h>
#include <transform/findings/Findings.h>
#include <translation/generation/CopiedFlows.h>
#include <translation/graph/InnerAttributes.h>

#include <QByteArray>
#include <QHash>
#include <QString>
#include <QStringList>

#include <memory>
#include <vector>

class ExternalDocNetwork;
class MFBuffer;
class WrittenCheck;
class SubDocNetworkObjXformer;
class TransformerCfg;

class CustomDefinition {
 public:
  // `network` is not changed: what is written are copies of its transformers. `surroundings` is the listener
  // of the workspace. Neither is owned.
  CustomDefinition(const ExternalDocNetwork& network, const TransformerCfgListener& surroundings);
  ~CustomDefinition();

  const ExternalDocNetwork& network() const { return m_network; }

  // Orders and connects the copies. False when they feed each other in a circle, or a name cannot be
  // written.
  bool arrange(orx::Findings& diagnostics);
  // The four below: call after arrange() answered true. Whether a statement names the attributes that reach
  // it.
  bool namesAttributes() const;
  // Tells the copies what reaches them when `arriving` reaches the inputs.
  void passAttributes(const InnerAttributes::ByPort& arriving);
  // Those of the copies that are custom transformers, in the order of their statements.
  std::vector<const TransformerCfg*> customTransformers() const;
  // Checks what will be written, makes the text. False when anything forbids that, found here or before.
  bool prepare(orx::Findings& diagnostics);
  // All below: call after prepare() answered true.
  void write(MFBuffer& buffer, WrittenCheck* check) const;
  // The definition's own lines, without the marks around them and without their prefix.
  QStringList lines() const;
  // The first fields of the line that opens the block: name, version, category, GUID.
  QStringList headerFields() const;
  // The block that write() writes.
  QByteArray block() const;

 private:
  class Listener;

  struct Part {
    const SubDocNetworkObjXformer* node = nullptr;
    std::unique_ptr<TransformerCfg> cfg;
    int firstLine = 0;  // in the body, from 0
  };

  void checkField(QLatin1String field, const QString& value, orx::Findings& diagnostics) const;
  bool order(orx::Findings& diagnostics);
  void nameFlows(orx::Findings& diagnostics);
  void makePart(const SubDocNetworkObjXformer& node);
  void connect(Part& part) const;
  void check(const Part& part, orx::Findings& diagnostics) const;
  QString innerName(const QString& name) const;
  // The flow at a port of that node, without the prefix.
  QString flowAt(const SubDocNetworkObj& node, const QString& port) const;
  // The flow that a link brings to a port of that node.
  QString flowAlong(const SubDocNetworkObj::Link& link, const SubDocNetworkObj& target,
                    const QString& port) const;
  void writeCopies(MFBuffer& buffer, const QStringList& flows) const;
  QString title(const Part& part) const;
  QByteArray makeBody(orx::Findings& diagnostics);
  // The value of a copy's parameter, its references to published parameters led to the instance's macros.
  QString redirect(const TransformerCfg& cfg, const QString& parameter) const;

  const ExternalDocNetwork& m_network;
  const QString m_prefix;     // the prefix macro's name
  const QString m_reference;  // "$(PREFIX)"
  std::unique_ptr<Listener> m_listener;
  std::vector<const SubDocNetworkObjXformer*> m_order;
  std::vector<Part> m_parts;
  QHash<const SubDocNetworkObj*, QHash<QString, QString>> m_flows;  // of outputs that are connected, by port
  CopiedFlows m_copied;
  bool m_isArranged = false;
  QByteArray m_body;
  int m_portsLine = 0;  // in the body, from 0: what leads to the outputs
};
