#pragma once

#include "platform/win32/storage/FileWindow.h"

#include <objidl.h>

namespace win32 {

/// Looks over the tables of a compound file before libgsf takes it: libgsf believes the sizes in
/// the header, follows the directory by recursion and keeps it in sorted lists, so that a file made
/// for it could use up the stack, the memory or the time of the process.
/// @return S_OK; STG_E_FILEALREADYEXISTS when it is no compound file, STG_E_DOCFILETOOLARGE, or
/// STG_E_DOCFILECORRUPT
HRESULT CheckStructure(FileWindow& file);

} // namespace win32
