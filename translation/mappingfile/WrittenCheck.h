// Judges a mapping file while it is written, by the rules that judge one when it is read: what lint would
// call an error is a finding of whoever wrote the line. It passes on all that is written; what nobody
// suspects need not be judged.
#pragma once

#include <transform/findings/Findings.h>
#include <transform/text/MFBuffer.h>
#include <translation/mappingfile/MappingFileCheck.h>

#include <QIODevice>
#include <QString>

#include <utility>
#include <vector>

class ParameterLines;
class TransformerCfg;

// Who writes a line.
struct WrittenPlace {
  enum class Kind { Frame, HeaderLine, Parameter, Node };

  Kind kind = Kind::Frame;
  int line = 0;  // in the document
  QString name;  // of the node or parameter
  // Of a transformer; not owned.
  const TransformerCfg* cfg = nullptr;
  const ParameterLines* parameterLines = nullptr;
};

class WrittenCheck : public MFBuffer {
 public:
  // Takes the place of the buffer, which is not owned.
  explicit WrittenCheck(MFBuffer& target);
  ~WrittenCheck() override;

  void write(const QByteArray& bytes) override;
  // The lines from here on are the place's, or from so many lines further down.
  void begin(const WrittenPlace& place, int linesAhead = 0);
  // What follows, up to the next place, is not judged.
  void skip() { m_isJudged = false; }

  // Reports what is wrong with all that was judged: of each place the first fault, and nothing that was found
  // before.
  void finish(const CustomTransformerLookup& isInstalled, orx::Findings& findings);

 private:
  class Device : public QIODevice {
   public:
    explicit Device(WrittenCheck& check) : m_check(check) {}
    bool isSequential() const override { return true; }

   protected:
    qint64 readData(char*, qint64) override { return -1; }
    qint64 writeData(const char* bytes, qint64 size) override;

   private:
    WrittenCheck& m_check;
  };

  const WrittenPlace& placeOf(int line) const;
  static void report(const WrittenPlace& place, const orx::Finding& fault, orx::Findings& findings);

  MFBuffer& m_target;
  Device m_device;
  orx::Findings m_found{QString()};
  MappingFileCheck m_check;
  bool m_isJudged = true;
  std::vector<std::pair<int, WrittenPlace>> m_places;  // with their first lines among those that are judged
};
