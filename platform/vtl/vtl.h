// Toolkit of the document reader: list template, system encoding.
#pragma once

#include <platform/vtl/ORXTValSlist.h>
#include <platform/vtl/SystemEncoding.h>
