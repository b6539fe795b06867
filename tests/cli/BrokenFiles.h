// The broken files with what is to be said about them beside each.
#pragma once

#include <tests/cli/OrxtProcess.h>
#include <tests/support/QtPrinters.h>

inline QString brokenFolder() {
  return QStringLiteral(ORX_SOURCE_DIR) + "/tests/data/broken";
}

// Runs the command over every file of the folder; scripts/renew-expectations writes the expectations.
inline void expectSaidOfBroken(const QString& command, const QString& folder, const QString& suffix,
                               int least) {
  qputenv("XDG_DATA_HOME", "/nowhere");
  const QStringList names = QDir(folder).entryList({"*" + suffix});
  ASSERT_GE(names.size(), least);
  for (const QString& name : names) {
    const QByteArray before = readAll(folder + "/" + name);
    const Outcome run =
        orxt({command, "--resources", brokenFolder() + "/definitions", "--lang", "en", name}, folder);
    QString said = run.err;
    said.append(run.out).replace(ORX_SOURCE_DIR, "SOURCE");
    EXPECT_EQ(said + QString("exit status %1\n").arg(run.status),
              QString::fromUtf8(readAll(folder + "/" + name.chopped(suffix.size()) + ".expected")))
        << name.toStdString();
    EXPECT_EQ(readAll(folder + "/" + name), before) << name.toStdString();
  }
}
