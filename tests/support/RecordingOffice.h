#pragma once

#include <afxdisp.h>

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <vector>

/// Office applications that do nothing but note every call that reaches them: class objects that
/// stand for Word, Excel, PowerPoint and Publisher, with the objects behind them.
///
/// The journal holds one line per event, in order. A call is its object, DISPID, kind and
/// arguments:
///
///     Documents.15 method (&"C:\in.doc", &omitted, &I2 1)
///
/// and the release of an object's last reference:
///
///     ~Documents
///
/// An ampersand marks an argument passed by reference.
class RecordingOffice {
public:
    /// What a call does before it answers. May write a file, may throw one of the two below.
    using Action = std::function<void(const std::vector<std::wstring>& texts)>;

    /// Makes the call raise an automation exception, as an application does.
    struct Raise {
        std::wstring description;
    };
    /// Makes the call itself fail.
    struct Fail {
        HRESULT result;
    };

    /// @param progIds the applications to be found in the registry, for instance "Word.Application"
    /// @param version the number at the end of their CurVer entry; 0 leaves the entry out
    explicit RecordingOffice(const std::vector<std::wstring>& progIds, int version = 16);
    ~RecordingOffice();
    RecordingOffice(const RecordingOffice&) = delete;
    RecordingOffice& operator=(const RecordingOffice&) = delete;

    /// @param action runs on each call of that member; it is given the call's text arguments
    void On(const std::string& object, DISPID member, Action action);

    /// @param action runs whenever an application is started, and may throw
    void OnStart(std::function<void()> action);

    /// @param note says what stands behind the releases in the journal, at the time of each
    void NoteAtReleases(std::function<std::string()> note);

    const std::vector<std::string>& Journal() const;
    /// The journal without arguments and kinds: "Documents.15", "~Documents".
    std::vector<std::string> JournalInShort() const;
    std::size_t LiveObjects() const;

    struct State;

private:
    std::shared_ptr<State> m_state;
    std::vector<std::wstring> m_progIds;
    std::vector<DWORD> m_cookies;
};
