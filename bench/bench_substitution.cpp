// Substitution: a template of 6 lines and 10 parameters, for 20,000 transformers. The step alone, values at
// hand and text out, against a general template library and against replacing token by token; beside it the
// whole of instantiate() into a buffer. All of them in one run, in turns; the ratios are those of the fastest
// turns.
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerDefinition.h>
#include <transform/core/definition/CompiledTemplate.h>
#include <transform/core/generation/TemplateExpansion.h>
#include <transform/text/MFBuffer.h>

#include <QBuffer>
#include <ctemplate/template.h>
#include <ctemplate/template_dictionary.h>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <functional>
#include <limits>
#include <memory>
#include <string>
#include <vector>

namespace {

constexpr int kTransformers = 20000;
constexpr int kParameters = 10;
constexpr int kTurns = 15;

QString parameterName(int number) {
  return QStringLiteral("PARAMETER_%1").arg(number);
}

const QStringList& templateLines() {
  static const QStringList lines{
      QStringLiteral("FACTORY_DEF * MeasureFactory FACTORY_NAME $(PARAMETER_0) MODE $(PARAMETER_1) UNIT "
                     "$(PARAMETER_2) OUTPUT RESULT FEATURE_TYPE $(PARAMETER_0)|RESULT"),
      QStringLiteral("FACTORY_OPTION $(PARAMETER_0) FACTOR $(PARAMETER_3)"),
      QStringLiteral("FACTORY_OPTION $(PARAMETER_0) ATTRIBUTE $(PARAMETER_4) LIST $(PARAMETER_5)"),
      QStringLiteral("FACTORY_OPTION $(PARAMETER_0) GROUP_BY $(PARAMETER_6)"),
      QStringLiteral("FACTORY_OPTION $(PARAMETER_0) TOLERANCE $(PARAMETER_7) PRECISION $(PARAMETER_8)"),
      QStringLiteral("FACTORY_DEF * TeeFactory FACTORY_NAME $(PARAMETER_0)|RESULT_Router INPUT FEATURE_TYPE "
                     "$(PARAMETER_0)|RESULT OUTPUT FEATURE_TYPE $(PARAMETER_9)"),
  };
  return lines;
}

QString value(int transformer, int parameter) {
  return QStringLiteral("value_%1_of_transformer_%2").arg(parameter).arg(transformer);
}

class Sink : public MFBuffer {
 public:
  Sink() {
    m_device.open(QIODevice::WriteOnly);
    setDevice(&m_device);
  }
  ~Sink() override { setDevice(nullptr); }
  void write(const QByteArray& bytes) override { m_device.write(bytes); }
  qint64 size() const { return m_device.size(); }

 private:
  QBuffer m_device;
};

double seconds(const std::function<void()>& work) {
  const auto start = std::chrono::steady_clock::now();
  work();
  return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

}  // namespace

int main() {
  std::vector<std::vector<QString>> values(kTransformers);
  std::vector<std::vector<std::string>> bytes(kTransformers);
  for (int i = 0; i < kTransformers; ++i) {
    for (int j = 0; j < kParameters; ++j) {
      values[std::size_t(i)].push_back(value(i, j));
      bytes[std::size_t(i)].push_back(value(i, j).toStdString());
    }
  }

  // Ours.
  const CompiledTemplate compiled(templateLines());
  std::vector<int> slots;
  QStringList tokens;
  std::vector<std::string> keys;
  for (int j = 0; j < kParameters; ++j) {
    slots.push_back(compiled.slotOf(parameterName(j)));
    tokens << QLatin1String("$(") + parameterName(j) + QLatin1Char(')');
    keys.push_back(parameterName(j).toStdString());
  }
  qint64 ownSize = 0;
  const auto own = [&] {
    ownSize = 0;
    for (const std::vector<QString>& given : values) {
      TemplateExpansion expansion(compiled);
      for (std::size_t j = 0; j < given.size(); ++j) {
        expansion.setValue(slots[j], given[j]);
      }
      for (const QString& line : expansion.lines()) {
        ownSize += line.size() + 1;
      }
    }
  };

  // The library, with the same template in its own notation.
  QString foreign = templateLines().join(QLatin1Char('\n')) + QLatin1Char('\n');
  foreign.replace(QLatin1String("$("), QLatin1String("{{")).replace(QLatin1Char(')'), QLatin1String("}}"));
  ctemplate::StringToTemplateCache("bench", foreign.toStdString(), ctemplate::DO_NOT_STRIP);
  qint64 librarySize = 0;
  const auto library = [&] {
    librarySize = 0;
    for (const std::vector<std::string>& given : bytes) {
      ctemplate::TemplateDictionary dictionary("bench");
      for (std::size_t j = 0; j < given.size(); ++j) {
        dictionary.SetValue(keys[j], given[j]);
      }
      std::string text;
      ctemplate::ExpandTemplate("bench", ctemplate::DO_NOT_STRIP, &dictionary, &text);
      librarySize += qint64(text.size());
    }
  };

  qint64 replaceSize = 0;
  const auto replace = [&] {
    replaceSize = 0;
    for (const std::vector<QString>& given : values) {
      QStringList lines = templateLines();
      for (int j = 0; j < kParameters; ++j) {
        for (QString& line : lines) {
          line.replace(tokens.at(j), given[std::size_t(j)]);
        }
      }
      for (const QString& line : lines) {
        replaceSize += line.size() + 1;
      }
    }
  };

  // Everything that instantiate() does, the reading of the values and the writing included.
  TransformerDefinition definition;
  definition.name = QStringLiteral("Measurer");
  definition.templateLines = templateLines();
  for (int j = 0; j < kParameters; ++j) {
    definition.parameterNames << parameterName(j);
    definition.parameterTypes << QStringLiteral("TEXT");
    definition.parameterPrompts << QString();
    definition.parameterDefaults << QString();
  }
  TransformerCfg prototype;
  prototype.configure(definition);
  std::vector<std::unique_ptr<TransformerCfg>> transformers;
  for (int i = 0; i < kTransformers; ++i) {
    transformers.emplace_back(prototype.getCopy());
    transformers.back()->setBaseGuid(QStringLiteral("g"));
    for (int j = 0; j < kParameters; ++j) {
      transformers.back()->setParameterValue(parameterName(j), values[std::size_t(i)][std::size_t(j)], false);
    }
  }
  bool isWritten = true;
  const auto whole = [&] {
    Sink sink;
    for (const auto& transformer : transformers) {
      isWritten = transformer->instantiate(sink, QString()) && isWritten;
    }
    isWritten = isWritten && sink.size() > ownSize;
  };

  double ownTime = std::numeric_limits<double>::max();
  double libraryTime = ownTime;
  double replaceTime = ownTime;
  double wholeTime = ownTime;
  for (int turn = 0; turn < kTurns; ++turn) {
    ownTime = std::min(ownTime, seconds(own));
    libraryTime = std::min(libraryTime, seconds(library));
    replaceTime = std::min(replaceTime, seconds(replace));
    wholeTime = std::min(wholeTime, seconds(whole));
  }
  if (ownSize != librarySize || ownSize != replaceSize || !isWritten) {
    std::fprintf(stderr, "the texts differ: %lld, %lld, %lld characters\n", static_cast<long long>(ownSize),
                 static_cast<long long>(librarySize), static_cast<long long>(replaceSize));
    return 1;
  }
  const auto perTransformer = [](double time) { return time / kTransformers * 1e9; };
  std::printf("%d transformers, 6 lines, %d parameters, %lld characters\n", kTransformers, kParameters,
              static_cast<long long>(ownSize));
  std::printf("substitution         %8.0f ns each\n", perTransformer(ownTime));
  std::printf("template library     %8.0f ns each, ratio %.2f\n", perTransformer(libraryTime),
              ownTime / libraryTime);
  std::printf("replace per token    %8.0f ns each, ratio %.2f\n", perTransformer(replaceTime),
              ownTime / replaceTime);
  std::printf("instantiate, whole   %8.0f ns each, substitution's share %.2f\n", perTransformer(wholeTime),
              ownTime / wholeTime);
  return 0;
}
