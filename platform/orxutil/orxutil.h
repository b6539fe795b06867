// Utility library: resource folders, message database, deciphering hook.
#pragma once

#include <platform/orxutil/Decipher.h>
#include <platform/orxutil/ORXLocalizedMessageDatabase.h>
#include <platform/orxutil/QORXString.h>
#include <platform/orxutil/ResourceDirectories.h>
