// Which files belong to the product.
#pragma once

#include <QString>

// Whether the file, or folder, lies under the product's home.
bool isProductFile(const QString& path);
