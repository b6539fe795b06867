// The messages of workspace documents.
#pragma once

#include <QStringList>

// The text of one of orx::messages. Never empty: without the message files, under a wrong home, it is the
// number and the arguments.
QString documentText(long number, const QStringList& arguments = QStringList());
