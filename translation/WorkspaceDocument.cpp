#include <transform/text/MessageNumbers.h>
#include <transform/workspace/DocumentCopy.h>
#include <transform/workspace/PlainFile.h>
#include <transform/workspace/VersionStore.h>
#include <transform/workspace/WorkspaceLoaderException.h>
#include <translation/WorkspaceDocument.h>

#include <QBuffer>
#include <QFile>

#include <algorithm>

namespace messages = orx::messages;

using orx::Rule;

WorkspaceDocument::Reading WorkspaceDocument::read(orx::Findings& diagnostics, QString& error,
                                                   Versions versions) {
  // Asked before the reader is, because its exceptions do not tell a missing file from a malformed one.
  if (!m_input.open()) {
    error = m_input.errorString();
    return Reading::Unreadable;
  }
  try {
    return readOpened(diagnostics, error, versions);
  } catch (const WorkspaceLoaderException& exception) {
    QString text = exception.getMessage();
    if (m_input.isCopy())
      text.replace(m_input.path(), InputFile::shownName(m_fileName));
    diagnostics.reportText(Rule::MalformedDocument, exception.line(), QString(), text, exception.number());
    return Reading::Refused;
  }
}

WorkspaceDocument::Reading WorkspaceDocument::readOpened(orx::Findings& diagnostics, QString& error,
                                                         Versions versions) {
  PlainFile file(m_input.path(), QStringLiteral("kx-in-XXXXXX"));
  m_form = WorkspaceFile::recognise(file);
  m_rawLines = RawLine::find(file);
  for (const RawLine& line : m_rawLines) {
    if (line.kind == RawLine::Kind::Conflict)
      diagnostics.report(Rule::ConflictMark, line.line, QString(), {line.text});
    else if (m_form != WorkspaceFile::Form::Workspace)
      continue;
    else if (line.kind == RawLine::Kind::OpenHeader)
      diagnostics.reportAs(Rule::MalformedDocument, messages::kOpenHeader, line.line, QString());
    else if (line.kind == RawLine::Kind::Behind)
      diagnostics.reportAs(Rule::StrayLine, messages::kBehindHeader, line.line, QString(), {line.text});
  }
  if (m_form == WorkspaceFile::Form::Versioned) {
    m_versions = VersionStore(m_input.path()).versions(error);
    if (!error.isEmpty())
      return Reading::Unreadable;
    if (versions == Versions::Refused || m_versions.isEmpty()) {
      diagnostics.reportAs(Rule::NoDocument, messages::kOnlyCustomTransformers, 0, QString());
      return Reading::Refused;
    }
    WorkspaceFile::read(m_reader, m_input.path(), m_headerLines);
  } else if (m_form != WorkspaceFile::Form::Unknown) {
    m_reader.ReadOpenedInput(file, m_input.path(), m_form == WorkspaceFile::Form::PlainXml, m_headerLines);
    m_file = WorkspaceFile(file, m_form, m_headerLines);
  }
  if (m_reader.GetDocumentType() != kUnknownDocument)
    return Reading::Done;
  diagnostics.report(Rule::NoDocument, 0, QString());
  return Reading::Refused;
}

bool WorkspaceDocument::originalBytes(QByteArray& bytes, QString& error) const {
  QFile file(m_input.path());
  if (!file.open(QIODevice::ReadOnly)) {
    error = file.errorString();
    return false;
  }
  bytes = file.readAll();
  error = file.errorString();
  return file.error() == QFileDevice::NoError;
}

std::vector<WorkspaceLossReport::Loss> WorkspaceDocument::losses() const {
  using Loss = WorkspaceLossReport::Loss;
  std::vector<Loss> losses = WorkspaceLossReport(m_reader).losses();
  for (const RawLine& line : m_rawLines) {
    if (line.kind == RawLine::Kind::Stray)
      losses.push_back({WorkspaceLossReport::Kind::RawLine, line.line, QString(), QString(), line.text});
  }
  std::stable_sort(losses.begin(), losses.end(),
                   [](const Loss& left, const Loss& right) { return left.line < right.line; });
  return losses;
}

orx::Finding WorkspaceDocument::findingOf(const WorkspaceLossReport::Loss& loss) {
  using Kind = WorkspaceLossReport::Kind;
  orx::Finding finding;
  finding.rule = Rule::LostContent;
  finding.line = loss.line;
  finding.text = loss.describe();
  finding.message = loss.message();
  if (loss.kind == Kind::MalformedValue)
    finding.rule = Rule::MalformedValue;
  else if (loss.kind == Kind::UnknownAttribute)
    finding.rule = Rule::UnknownAttribute;
  else if (loss.kind == Kind::UnknownElement || loss.kind == Kind::RepeatedElement || loss.kind == Kind::Text)
    finding.rule = Rule::UnknownElement;
  else if (loss.kind == Kind::RawLine)
    finding.rule = Rule::StrayLine;
  return finding;
}

bool WorkspaceDocument::canonicalBytes(QByteArray& bytes, QString& error) const {
  return bytesWith([this](XMLComponentWriter& writer) { copyDocument(m_reader, writer); }, bytes, error);
}

bool WorkspaceDocument::bytesWith(const Fill& fill, QByteArray& bytes, QString& error) const {
  QBuffer buffer(&bytes);
  buffer.open(QIODevice::WriteOnly);
  return m_file.write(buffer, m_reader.GetDocumentType(), fill, error);
}
