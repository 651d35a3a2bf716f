#pragma once

#include <string>
#include <utility>
#include <vector>

/// The bytes of a ZIP archive with the given files.
std::string ZipArchive(const std::vector<std::pair<std::string, std::string>>& files);

/// A Word document (docx).
/// @param body the paragraphs, in WordprocessingML
/// @param relationships further ones of the document, in XML
std::string WordPackage(const std::string& body, const std::string& relationships = "");

/// A paragraph of a Word document.
std::string Paragraph(const std::string& text);
