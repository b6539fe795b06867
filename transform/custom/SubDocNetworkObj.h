// One node of a custom transformer's network, and the base of its four kinds. A node belongs to its network;
// links are not owned.
#pragma once

#include <platform/Export.h>
#include <transform/core/AttributeSet.h>
#include <transform/custom/AttributeCopies.h>

#include <QHash>
#include <QString>
#include <QStringList>
#include <QVarLengthArray>

#include <cstdint>
#include <map>
#include <tuple>
#include <vector>

// What a query for attributes has met so far.
struct MetAttributes {
  AttributeSet names;
  QHash<QString, QString>* origins = nullptr;  // the node that each came from first; null: nobody asks
};

class ORX_EXPORT SubDocNetworkObj {
 public:
  enum class Kind : quint8 { Input, Output, Transformer, Loop };

  // One end of a link: a node, and its port there.
  struct Link {
    SubDocNetworkObj* node = nullptr;
    QString port;
  };
  // By port, in name order; the links of one port in the order of adding.
  using Ports = std::map<QString, std::vector<Link>>;

  SubDocNetworkObj(const SubDocNetworkObj&) = delete;
  SubDocNetworkObj& operator=(const SubDocNetworkObj&) = delete;
  virtual ~SubDocNetworkObj();

  // Takes in the attributes that reach the node through its links; what leaves it follows from them.
  // `met` receives each attribute met for the first time, with the name of the node that it came from.
  virtual void compute(MetAttributes& met) = 0;
  // What leaves the port; nothing before compute().
  virtual AttributeSet getAttributes(const QString& port) const = 0;

  Kind kind() const { return m_kind; }
  int number() const { return m_number; }
  // The port's or loop's name; the identifier of an inner transformer.
  QString name() const;
  // Of the element in the file that the network was read from; 0 when there is none.
  int line() const { return m_line; }
  void setLine(int line) { m_line = line; }
  // Whether a link of the document at this end was left out: it, or the node at its other end, is disabled or
  // at fault.
  bool lacksInputLink() const { return m_lacksInputLink; }
  bool lacksOutputLink() const { return m_lacksOutputLink; }
  void noteMissingInputLink() { m_lacksInputLink = true; }
  void noteMissingOutputLink() { m_lacksOutputLink = true; }
  // The nodes that feed this one, by the port of this node.
  const Ports& feeders() const { return m_feeders; }
  // The nodes that this one feeds, by the port of this node.
  const Ports& consumers() const { return m_consumers; }

  // Has an attribute go on under a second name along the link from `port` to that port of `target`.
  void addAttributeCopy(const QString& port, SubDocNetworkObj& target, const QString& targetPort,
                        const QString& from, const QString& to);
  const AttributeCopies& attributeCopies(const QString& port, const SubDocNetworkObj& target,
                                         const QString& targetPort) const;

  static void addLink(SubDocNetworkObj& from, const QString& fromPort, SubDocNetworkObj& to,
                      const QString& toPort);
  // Takes out every link from and to this node.
  void removeLinks();

  // Forgets that the node was computed.
  void beginQuery();
  // Whether what leaves the node may be other than at the compute() before; true for the first one.
  bool hasChanged() const { return m_hasChanged; }

 protected:
  // What leaves by the ports of a node, kept until it is computed anew.
  struct Outlet {
    AttributeSet attributes;
    bool isCurrent = false;
  };
  // Where a link comes from.
  struct Source {
    SubDocNetworkObj* node;
    Outlet* outlet;
    std::uint32_t serial;  // of the node
  };
  using Sources = QVarLengthArray<Source, 2>;

  SubDocNetworkObj(Kind kind, int number, const QString& name);

  void setName(const QString& name) { m_name = name; }

  // Ports in name order, links in the order of adding.
  const Sources& sources();
  // What the sources bring, in their order.
  static AttributeSet collect(const Source* begin, const Source* end, MetAttributes& met);
  // The same over all ports.
  AttributeSet collect(MetAttributes& met);
  // Enters those that were not met before as attributes of this node.
  void noteOrigins(const AttributeSet& attributes, MetAttributes& met) const;

  // Ends compute(). The same attributes leave by every port, but for copies.
  void setLeaving(const AttributeSet& attributes);
  const AttributeSet& leaving() const { return m_common.attributes; }
  // Ends compute() where each port has to be asked.
  void noteComputed(bool changed);
  bool isComputed() const { return m_isComputed; }

 private:
  friend class CompoundTransformerNetwork;
  friend class NetworkSorter;

  // A port of this node, and where a link leads from there.
  using LinkEnds = std::tuple<QString, const SubDocNetworkObj*, QString>;
  // Of one port alone, or of one link that copies attributes.
  struct PortOutlet : Outlet {
    QString port;
    const AttributeCopies* copies = nullptr;
  };

  Outlet& outlet(const LinkEnds& ends);
  Source sourceAt(const QString& port, const SubDocNetworkObj& target, const QString& targetPort) {
    return {this, &outlet({port, &target, targetPort}), m_serial};
  }
  void fill(Outlet& outlet, MetAttributes& met);
  void forgetOutlets();

  // What a query works with stands together.
  std::uint32_t m_serial = 0;  // counts the nodes of the network; given before any link
  Kind m_kind;
  bool m_knowsSources = true;
  bool m_isComputed = false;
  bool m_hasChanged = true;
  Outlet m_common;  // of all ports that have none of their own
  Sources m_sources;
  bool m_hasOutlets = false;
  int m_number;
  std::map<LinkEnds, PortOutlet> m_outlets;  // of transformers, and where copies are made

  QString m_name;
  int m_line = 0;
  bool m_lacksInputLink = false;
  bool m_lacksOutputLink = false;
  Ports m_feeders;
  Ports m_consumers;
  std::map<LinkEnds, AttributeCopies> m_copies;
};

inline void SubDocNetworkObj::beginQuery() {
  m_isComputed = false;
  m_common.isCurrent = false;
  if (m_hasOutlets)
    forgetOutlets();
}
