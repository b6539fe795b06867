// What every command that loads definitions takes: further folders and the language, which is set as soon as
// it is read.
#pragma once

#include <string>
#include <vector>

namespace CLI {
class App;
}
class Console;
class TransformerMgr;

class DefinitionOptions {
 public:
  void declare(CLI::App& app);
  // Of a command that loads no definitions.
  void declareLanguage(CLI::App& app);
  // Sets folders, loads the registry once and says on the console what could not be loaded.
  TransformerMgr& load(Console& console) const;
  // The same for those who look at the catalogue itself: also says what was refused, and when it is empty.
  TransformerMgr& loadCatalogue(Console& console) const;
  // Says on the console when there are no texts in the language that the environment asks for.
  static void checkLanguage(Console& console);

 private:
  std::vector<std::string> m_resources;
  std::string m_language;
};
