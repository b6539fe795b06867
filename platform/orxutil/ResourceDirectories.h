// The ordered folders in which resources of one kind are looked for.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QStringList>

// Folders of kind "transformer", in loading order: the home's transformers folder and its sub-folders by
// name, the user's data folder ($XDG_DATA_HOME/orx/transformers, by default ~/.local/share/orx/transformers),
// the folders of $ORX_TRANSFORMER_PATH (separated by ":"), and the folders added by the call below. Only
// folders that can be read and hold a file are returned, each once. Another kind names the folder of the same
// name followed by "s" in the home and the user's data folder, and a variable of its own ($ORX_FORMAT_PATH
// for "format"). A kind is a word of ASCII letters, digits and underscores; any other has no folders.
ORX_EXPORT QStringList ORX_resourceDirectories(const QString& kind);

// The folders of those places that are there but may not be read, each once.
ORX_EXPORT QStringList ORX_unreadableResourceDirectories(const QString& kind);

// Where folders of a kind are looked for, for a message to people: the same places, whether they exist or
// not, without the sub-folders of the home.
ORX_EXPORT QStringList ORX_resourcePlaces(const QString& kind);

// Adds a folder behind all others of every kind, for the rest of the process.
ORX_EXPORT void ORX_addResourceDirectory(const QString& folder);
