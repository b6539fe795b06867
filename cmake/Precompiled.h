// What nearly every source file of the tree includes anyway.
#pragma once

#include <QByteArray>
#include <QFile>
#include <QHash>
#include <QString>
#include <QStringList>
#include <QTextStream>
#include <QVector>

#include <algorithm>
#include <functional>
#include <map>
#include <memory>
#include <vector>
