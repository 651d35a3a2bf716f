#pragma once

/// What the tests have to know of the system that the program runs on.
namespace System {

#ifdef _WIN32
/// Whether documents are converted side by side: not where all of a user's processes share one
/// registry.
constexpr bool ConvertsSideBySide = false;
/// Whether a file can be removed while it is open.
constexpr bool RemovesOpenFiles = false;
constexpr char ModuleSuffix[] = ".dll";
/// What is said to install where Office or PowerPoint is missing.
constexpr char OfficeAdvice[] = "Install Microsoft Office";
constexpr char PowerPointAdvice[] = "Install Microsoft PowerPoint";
#else
constexpr bool ConvertsSideBySide = true;
constexpr bool RemovesOpenFiles = true;
constexpr char ModuleSuffix[] = ".so";
constexpr char OfficeAdvice[] = "apt-get install libreoffice-writer-nogui";
constexpr char PowerPointAdvice[] = "libreoffice-impress-nogui";
#endif

/// Has this process do nothing any more, as one that hangs for good.
void StopThisProcess();

/// Ends this process as somebody does who wants it gone.
void EndThisProcess();

} // namespace System
