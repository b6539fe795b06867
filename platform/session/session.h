// The closed string types and the session interface, with plain implementations.
#pragma once

#include <platform/session/IORXSession.h>
#include <platform/session/IORXString.h>
#include <platform/session/IORXStringArray.h>
#include <platform/session/ORXSession.h>
#include <platform/session/ORXString.h>
#include <platform/session/ORXStringArray.h>
