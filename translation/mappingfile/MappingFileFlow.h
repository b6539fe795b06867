// The factories of a mapping file, or of one definition in it, and the feature types between them.
#pragma once

#include <QHash>
#include <QString>
#include <QStringList>

#include <vector>

class MappingFileReport;

class MappingFileFlow {
 public:
  enum class Role {
    Ordinary,
    Route,   // leads out of the file or definition: what it gives is taken elsewhere
    Worker,  // hands features to worker processes: shares its name with the factory that they run
  };

  void addFactory(const QString& name, Role role, int line, MappingFileReport& report);
  // A worker runs the statements behind it whose factory bears the name.
  void addWorkerRun(const QString& name, int line) { m_runs.push_back({name, line}); }
  // `name` is the word encoding of a factory's.
  void addOption(const QString& name, int line);
  void take(const QString& type, int line);
  // A writer takes it, wherever it is given.
  void write(const QString& type, int line);
  void give(const QString& type, int line, Role role);

  // How much is remembered.
  std::size_t size() const {
    return static_cast<std::size_t>(m_factories.size() + m_workers.size()) + m_types.size() +
           m_takenEarly.size() + m_lostOptions.size() + m_runs.size();
  }
  // Reports what does not fit together.
  void finish(MappingFileReport& report) const;

 private:
  struct Place {
    QString name;
    int line;
  };
  struct TakenType {
    QString name;
    int line;
    bool mayBeLate;
  };
  struct Type {
    QString name;
    int givenLine = 0;  // first; 0 when nothing gives it
    bool isTaken = false;
    bool isRoute = false;
  };

  Type& type(const QString& name);
  bool isInnerType(const QString& name) const;

  QHash<QString, int> m_factories;  // line of the last one of a name, workers left out
  QHash<QString, int> m_encoded;    // first line by word-encoded name
  QStringList m_encodedNames;
  QHash<QString, int> m_workers;
  QHash<QString, std::size_t> m_numbers;
  std::vector<Type> m_types;  // in the order of their first mention
  std::vector<TakenType> m_takenEarly;
  std::vector<Place> m_lostOptions;
  std::vector<Place> m_runs;
};
