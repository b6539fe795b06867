#include <transform/core/TransformerCfg.h>
#include <transform/registry/catalogue/CatalogueEntry.h>
#include <transform/registry/loading/CompanionFileParser.h>
#include <transform/registry/loading/DefinitionFileParser.h>
#include <transform/specialised/TransformerCfgFactory.h>

namespace {

void applyCompanion(const CompanionEntry& entry, TransformerCfg& prototype) {
  if (!entry.localizedName.isEmpty()) {
    prototype.setLocalizedName(entry.localizedName);
  }
  for (const CompanionEntry::Text& prompt : entry.prompts) {
    if (!prompt.text.isEmpty() && prototype.hasParameter(prompt.name)) {
      prototype.setParameterPrompt(prompt.name, prompt.text);
    }
  }
  for (const CompanionEntry::Text& tag : entry.tagDescriptions) {
    prototype.setTagDescription(tag.name, tag.text);
  }
  if (!entry.descriptionLines.isEmpty()) {
    prototype.setDescriptionLines(entry.descriptionLines);
  }
  if (!entry.tooltipLines.isEmpty()) {
    prototype.setTooltipLines(entry.tooltipLines);
  }
  if (!entry.changeLog.isEmpty()) {
    prototype.setChangeLog(entry.changeLog);
  }
}

std::unique_ptr<TransformerCfg> makePrototype(const CatalogueEntry::Unread& unread) {
  TransformerDefinition fields = DefinitionFileParser::definitionAlone(unread.bytes, unread.path);
  fields.allowed = unread.isAllowed;
  fields.language = unread.load->language;
  std::unique_ptr<TransformerCfg> prototype(createTransformerCfg(fields.name, fields.version));
  prototype->configure(fields, unread.load->session);
  prototype->setDefinitionDirectory(unread.load->directory);
  for (const auto& companion : unread.companions) {
    applyCompanion(*companion, *prototype);
  }
  return prototype;
}

}  // namespace

CatalogueEntry::CatalogueEntry(int version, Unread definition)
    : m_version(version), m_unread(std::make_unique<Unread>(std::move(definition))) {}
CatalogueEntry::CatalogueEntry(std::unique_ptr<TransformerCfg> prototype)
    : m_version(prototype->getVersion()), m_prototype(std::move(prototype)) {}
CatalogueEntry::~CatalogueEntry() = default;
CatalogueEntry::CatalogueEntry(CatalogueEntry&&) noexcept = default;
CatalogueEntry& CatalogueEntry::operator=(CatalogueEntry&&) noexcept = default;

QString CatalogueEntry::fileName() const {
  return m_unread ? m_unread->path : m_prototype->getFileName();
}

TransformerCfg& CatalogueEntry::prototype() const {
  if (!m_prototype) {
    m_prototype = makePrototype(*m_unread);
    m_unread.reset();
  }
  return *m_prototype;
}

void CatalogueEntry::localize(const std::shared_ptr<const CompanionEntry>& companion) {
  if (m_unread) {
    m_unread->companions.push_back(companion);
  } else {
    applyCompanion(*companion, *m_prototype);
  }
}
