// Parameter library: types of parameters, their prompt lines, choices and member lists.
#pragma once

#include <platform/orxparameter/ChoiceList.h>
#include <platform/orxparameter/ConfigToken.h>
#include <platform/orxparameter/GUIType.h>
#include <platform/orxparameter/GUITypeTable.h>
#include <platform/orxparameter/MemberList.h>
