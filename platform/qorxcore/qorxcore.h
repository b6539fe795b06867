// Core text and folder routines: everything of the library in one include.
#pragma once

#include <platform/qorxcore/Language.h>
#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/Local8Bit.h>
#include <platform/qorxcore/OrxHome.h>
#include <platform/qorxcore/Quoting.h>
#include <platform/qorxcore/WordEncoding.h>
