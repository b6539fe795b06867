#include <transform/core/GenerationKeywords.h>
#include <transform/core/generation/TemplateExpansion.h>

#include <algorithm>
#include <cstring>

TemplateExpansion::TemplateExpansion(const CompiledTemplate& compiled)
    : m_compiled(compiled), m_slots(compiled.slotCount()) {
  m_removed.resize(static_cast<int>(compiled.compiledLines().size()));
  std::fill(m_removed.begin(), m_removed.end(), false);
}

void TemplateExpansion::setValue(int slot, const QString& value) {
  if (slot != CompiledTemplate::kNoSlot && !m_slots[slot].isSet) {
    m_slots[slot].value = value;
    m_slots[slot].isSet = true;
  }
}

void TemplateExpansion::removeLinesWith(const QString& token) {
  const int slot = m_compiled.slotOf(token);
  if (slot == CompiledTemplate::kNoSlot) {
    return;
  }
  for (const int line : m_compiled.linesOf(slot)) {
    m_removed[line] = true;
  }
}

// The clause is the lines of its token: the template is one with clauses of one line.
void TemplateExpansion::removeOutput(const QString& tag) {
  removeLinesWith(kOutputTokenStart + tag + kFeatureTypeTokenEnd);
}

bool TemplateExpansion::contains(const QString& token) const {
  const int slot = m_compiled.slotOf(token);
  if (slot == CompiledTemplate::kNoSlot) {
    return false;
  }
  const std::vector<int>& lines = m_compiled.linesOf(slot);
  return std::any_of(lines.begin(), lines.end(), [this](int line) { return !m_removed[line]; });
}

QStringList TemplateExpansion::lines() const {
  const std::vector<CompiledTemplate::Line>& compiled = m_compiled.compiledLines();
  QStringList lines;
  lines.reserve(static_cast<int>(compiled.size()));
  for (int number = 0; number < m_removed.size(); ++number) {
    const CompiledTemplate::Line& line = compiled[static_cast<std::size_t>(number)];
    if (m_removed[number]) {
      continue;
    }
    int size = line.textSize;
    bool isChanged = false;
    for (int i = line.firstPiece; i < line.endPiece; ++i) {
      const CompiledTemplate::Piece& piece = m_compiled.pieces()[static_cast<std::size_t>(i)];
      if (piece.slot != CompiledTemplate::kNoSlot) {
        const Slot& slot = m_slots[piece.slot];
        size += slot.isSet ? slot.value.size() : piece.size;
        isChanged = isChanged || slot.isSet;
      }
    }
    if (!isChanged) {
      lines.append(m_compiled.lines().at(number));
      continue;
    }
    QString text = expand(line, size);
    if (line.staysText || !std::all_of(text.cbegin(), text.cend(), [](QChar c) { return c.isSpace(); })) {
      lines.append(std::move(text));
    }
  }
  return lines;
}

QString TemplateExpansion::expand(const CompiledTemplate::Line& line, int size) const {
  QString text(size, Qt::Uninitialized);
  QChar* out = text.data();
  const QChar* source = m_compiled.text().constData();
  for (int i = line.firstPiece; i < line.endPiece; ++i) {
    const CompiledTemplate::Piece& piece = m_compiled.pieces()[static_cast<std::size_t>(i)];
    const bool isValue = piece.slot != CompiledTemplate::kNoSlot && m_slots[piece.slot].isSet;
    const QChar* from = isValue ? m_slots[piece.slot].value.constData() : source + piece.begin;
    const int count = isValue ? m_slots[piece.slot].value.size() : piece.size;
    std::memcpy(static_cast<void*>(out), from, static_cast<std::size_t>(count) * sizeof(QChar));
    out += count;
  }
  return text;
}
