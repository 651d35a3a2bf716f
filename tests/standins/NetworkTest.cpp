#include "tests/standins/FakeEngine.h"
#include "tests/standins/OfficeTest.h"

#include <wx/mstream.h>
#include <wx/zipstrm.h>

#include <arpa/inet.h>
#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

#include <cstdlib>

namespace {

class NetworkTest : public OfficeTest {};

/// A server on this machine that answers nobody.
class LoopbackListener {
public:
    LoopbackListener() : m_socket(socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0)) {
        sockaddr_in address{};
        socklen_t size = sizeof address;
        address.sin_family = AF_INET;
        address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
        EXPECT_EQ(0, bind(m_socket, reinterpret_cast<const sockaddr*>(&address), size));
        EXPECT_EQ(0, listen(m_socket, 16));
        getsockname(m_socket, reinterpret_cast<sockaddr*>(&address), &size);
        m_port = std::to_string(ntohs(address.sin_port));
    }
    ~LoopbackListener() { close(m_socket); }
    LoopbackListener(const LoopbackListener&) = delete;
    LoopbackListener& operator=(const LoopbackListener&) = delete;

    const std::string& Port() const { return m_port; }
    /// Whether somebody has come.
    bool HasVisitor() const {
        pollfd event{m_socket, POLLIN, 0};
        return poll(&event, 1, 0) > 0;
    }

private:
    int m_socket;
    std::string m_port;
};

/// The bytes of an Open XML package.
/// @param parts by their names; $ in them stands for the address of Open XML's schemas
std::string Package(std::initializer_list<std::pair<const char*, wxString>> parts) {
    wxMemoryOutputStream bytes;
    wxZipOutputStream archive(bytes);
    for (auto [name, content] : parts) {
        content.Replace("$", "http://schemas.openxmlformats.org");
        archive.PutNextEntry(name);
        archive.WriteAll(content.utf8_str(), content.utf8_str().length());
    }
    archive.Close();
    std::string result(bytes.GetSize(), '\0');
    bytes.CopyTo(result.data(), result.size());
    return result;
}

/// A Word document with a picture that lies elsewhere.
std::string DocumentWithLink(const std::string& picture) {
    return Package({
        {"[Content_Types].xml", R"(
<Types xmlns="$/package/2006/content-types">
  <Default Extension="rels"
           ContentType="application/vnd.openxmlformats-package.relationships+xml"/>
  <Override PartName="/document.xml" ContentType=
            "application/vnd.openxmlformats-officedocument.wordprocessingml.document.main+xml"/>
</Types>)"},
        {"_rels/.rels", R"(
<Relationships xmlns="$/package/2006/relationships">
  <Relationship Id="rId1" Target="document.xml"
                Type="$/officeDocument/2006/relationships/officeDocument"/>
</Relationships>)"},
        {"_rels/document.xml.rels", R"(
<Relationships xmlns="$/package/2006/relationships">
  <Relationship Id="rId1" Target=")" + picture +
                                        R"(" TargetMode="External"
                Type="$/officeDocument/2006/relationships/image"/>
</Relationships>)"},
        {"document.xml", R"(
<w:document xmlns:w="$/wordprocessingml/2006/main"
            xmlns:r="$/officeDocument/2006/relationships"
            xmlns:wp="$/drawingml/2006/wordprocessingDrawing"
            xmlns:a="$/drawingml/2006/main" xmlns:pic="$/drawingml/2006/picture">
  <w:body><w:p><w:r><w:drawing><wp:inline>
    <wp:extent cx="900000" cy="900000"/>
    <a:graphic><a:graphicData uri="$/drawingml/2006/picture"><pic:pic>
      <pic:blipFill><a:blip r:link="rId1"/></pic:blipFill>
    </pic:pic></a:graphicData></a:graphic>
  </wp:inline></w:drawing></w:r></w:p></w:body>
</w:document>)"},
    });
}

} // namespace

TEST_F(NetworkTest, NoRequestLeavesADocument) {
    const LoopbackListener listener;
    const std::string picture = "http://127.0.0.1:" + listener.Port() + "/picture.png";
    EXPECT_EQ("", Print(m_files.Write("link.docx", DocumentWithLink(picture))));
    EXPECT_FALSE(listener.HasVisitor());
}

TEST_F(NetworkTest, AnEngineReachesNoServer) {
    const LoopbackListener listener;
    const std::string visit = "bash -c ': > /dev/tcp/127.0.0.1/" + listener.Port() + "'";
    const FakeEngine engine(visit + "\n" + FakeEngine::MakePdf());
    EXPECT_EQ("", Open(NewDocument()));
    EXPECT_FALSE(listener.HasVisitor());
    EXPECT_EQ(0, std::system(visit.c_str())); // NOLINT(concurrency-mt-unsafe,cert-env33-c)
    EXPECT_TRUE(listener.HasVisitor());
}
