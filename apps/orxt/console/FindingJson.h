// A finding as JSON.
#pragma once

#include <transform/findings/Finding.h>

#include <QJsonArray>
#include <QJsonObject>

#include <vector>

QJsonObject toJson(const orx::Finding& finding);
QJsonArray toJson(const std::vector<orx::Finding>& findings);
