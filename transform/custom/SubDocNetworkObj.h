// One node of a custom transformer's network, and the base of its four kinds. A node belongs to its network;
// links are not owned.
#pragma once

#include <platform/Export.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <map>
#include <vector>

class ORX_EXPORT SubDocNetworkObj {
 public:
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
  // `origins` receives each attribute met for the first time, with the name of the node that it came from.
  virtual void compute(QHash<QString, QString>& origins) = 0;
  // What leaves the port; nothing before compute().
  virtual QStringList getAttributes(const QString& port) const = 0;

  // The port's or loop's name; the identifier of an inner transformer.
  virtual QString name() const = 0;

  int number() const { return m_number; }
  // The nodes that feed this one, by the port of this node.
  const Ports& feeders() const { return m_feeders; }
  // The nodes that this one feeds, by the port of this node.
  const Ports& consumers() const { return m_consumers; }

  // Where an attribute goes on from this node under a second name.
  struct AttributeCopy {
    QString from;
    QString to;
  };
  void addAttributeCopy(const QString& port, const QString& from, const QString& to);
  const std::map<QString, std::vector<AttributeCopy>>& attributeCopies() const { return m_copies; }
  // `attributes`, and behind them the copies made at the port.
  QStringList withCopies(const QString& port, const QStringList& attributes) const;

  static void addLink(SubDocNetworkObj& from, const QString& fromPort, SubDocNetworkObj& to,
                      const QString& toPort);
  // Takes out every link from and to this node.
  void removeLinks();

  // Forgets what was computed.
  void beginQuery();
  // Whether what reaches the node is other than at the compute() before; true for the first one.
  bool hasChanged() const { return m_hasChanged; }

 protected:
  explicit SubDocNetworkObj(int number) : m_number(number) {}

  // What the links bring to one port, each name once, in the order of the links.
  QStringList collect(const std::vector<Link>& links, QHash<QString, QString>& origins) const;
  // The same over all ports, in name order.
  QStringList collectAll(QHash<QString, QString>& origins) const;

  // Notes that compute() ran. `arrived` is what reaches the node.
  void noteComputed(const QStringList& arrived);
  void noteComputed(bool changed);
  bool isComputed() const { return m_isComputed; }
  const QStringList& arrived() const { return m_arrived; }

 private:
  friend class NodeSet;
  friend class NetworkOrder;

  int m_number;
  Ports m_feeders;
  Ports m_consumers;
  std::map<QString, std::vector<AttributeCopy>> m_copies;
  QStringList m_arrived;
  bool m_isComputed = false;
  bool m_hasChanged = true;
  quint64 m_mark = 0;   // of the NodeSet that it was last entered in
  int m_position = -1;  // in the list that is being ordered
};
