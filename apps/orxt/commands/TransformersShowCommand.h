#pragma once

#include <apps/orxt/console/Command.h>
#include <apps/orxt/console/DefinitionOptions.h>

#include <string>

class TransformerCfg;
class TransformerMgr;

class TransformersShowCommand : public Command {
 public:
  TransformersShowCommand();
  void declare(CLI::App& app) override;
  ExitStatus run(Console& console) override;

 private:
  void showText(const TransformerCfg& cfg, const TransformerMgr& registry, Console& console) const;
  void showJson(const TransformerCfg& cfg, const TransformerMgr& registry, Console& console) const;

  std::string m_name;
  std::string m_version = "newest";
  bool m_json = false;
  bool m_schema = false;
  DefinitionOptions m_definitions;
};
