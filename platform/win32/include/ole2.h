#pragma once

#include <objbase.h>
#include <objidl.h>
#include <oleauto.h>
