// What every command that loads definitions takes: further folders and the language.
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
  // Sets language and folders, loads the registry once and says on the console what could not be loaded.
  TransformerMgr& load(Console& console) const;
  // The same for those who look at the catalogue itself: also says what was refused, and when it is empty.
  TransformerMgr& loadCatalogue(Console& console) const;
  // Sets the language alone.
  void setLanguage() const;

 private:
  std::vector<std::string> m_resources;
  std::string m_language;
};
