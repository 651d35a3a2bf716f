#pragma once

#include "standins/office/inprocess/AutomationObject.h"
#include "standins/office/inprocess/FilePrinter.h"
#include "standins/office/inprocess/OpenedDocument.h"

#include <string>
#include <vector>

namespace standins {

// What the object models of all applications have in common.

/// The root: one running application.
class ApplicationObject : public AutomationObject {
protected:
    /// @param name as for Session
    ApplicationObject(const wchar_t* name, std::vector<Member> members);

    /// What is to be saved does not matter: documents are never changed.
    void Quit(Call& call);
};

/// Which arguments of its PrintOut tell what every application wants to know.
struct PrintArguments {
    UINT outputFile;
    UINT copies;
    UINT collate;
};

/// A document that is open in an application.
class DocumentObject : public AutomationObject {
protected:
    DocumentObject(SharedSession session, OpenedDocument document, std::vector<Member> members);

    const OpenedDocument& Document() const { return m_document; }

    /// What is to be saved does not matter: documents are never changed.
    void Close(Call& call);

    /// Prints into the file that the call names.
    /// @param printer whose paper it is for
    /// @param pages what is made of the document
    /// @param layout as in PrintRequest
    void Print(const Call& call, const std::wstring& printer, const PrintArguments& arguments,
               Export pages, std::vector<std::string> layout = {}) const;

private:
    OpenedDocument m_document;
};

/// Answers a call that opens a document, whose path is its first argument.
/// @param formats those that the application opens
template <typename Document>
void ReturnOpened(Call& call, const SharedSession& session,
                  const std::vector<DocumentFormat>& formats) {
    call.Return(MakeObject<Document>(session, OpenedDocument(call.Text(0), formats)));
}

[[noreturn]] void RaiseNotToFile();

/// The arguments of a PrintOut that begin with From, To and PrintToFileName.
constexpr PrintArguments AfterRange{2, 3, 4};

/// Refuses what would have to be done otherwise than asked by such a PrintOut.
/// @param notWhole what is raised when a part of the document is asked for
void RequireWholeToFile(const Call& call, const wchar_t* notWhole);

} // namespace standins
