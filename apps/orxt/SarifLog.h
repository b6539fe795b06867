// Findings as a SARIF 2.1.0 log, which code hosts and editors take.
#pragma once

#include <translation/WorkspaceValidation.h>

#include <QJsonObject>

#include <vector>

// One run with the findings of all reports. A file that cannot be read is a notification of the run, which
// then counts as not successful.
QJsonObject sarifLog(const std::vector<ValidationReport>& reports);
