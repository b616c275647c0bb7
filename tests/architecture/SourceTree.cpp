// SPDX-License-Identifier: MIT
#include "architecture/SourceTree.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <regex>
#include <sstream>

namespace penwick::test {

namespace {

namespace fs = std::filesystem;

const char *const folders[] = { "include", "src", "host", "examples", "tests", "bench" };

std::string contents(const fs::path &file)
{
    std::ifstream stream(file);
    return { std::istreambuf_iterator<char>(stream), {} };
}

bool isSource(const fs::path &file)
{
    return file.extension() == ".h" || file.extension() == ".cpp" || file.extension() == ".mm";
}

bool startsWith(const std::string &text, const std::string &start)
{
    return text.compare(0, start.size(), start) == 0;
}

} // namespace

SourceTree::SourceTree(const std::string &root)
{
    for (const char *const folder : folders) {
        if (!fs::exists(fs::path(root) / folder))
            continue;
        for (const auto &entry : fs::recursive_directory_iterator(fs::path(root) / folder)) {
            const std::string name = fs::relative(entry.path(), root).generic_string();
            if (isSource(entry.path()))
                m_texts.emplace(name, contents(entry.path()));
            else if (entry.path().filename() == "CMakeLists.txt" && startsWith(name, "src/"))
                readModule(name, contents(entry.path()));
        }
    }
}

void SourceTree::readModule(const std::string &file, const std::string &text)
{
    const auto start = text.find("penwick_add_module(");
    if (start == std::string::npos)
        return;
    std::string call = text.substr(text.find('(', start) + 1);
    call.resize(call.find("\n\n") == std::string::npos ? call.size() : call.find("\n\n"));
    std::replace(call.begin(), call.end(), ')', ' ');
    std::istringstream words(call);
    Module module;
    words >> module.name;
    module.folder = file.substr(0, file.rfind('/'));
    const std::set<std::string> keywords { "SOURCES", "QT", "DEPENDS", "LIBRARIES" };
    const std::string fromRoot = "${PROJECT_SOURCE_DIR}/";
    std::string keyword;
    for (std::string word; words >> word;) {
        if (keywords.count(word))
            keyword = word;
        else if (keyword == "DEPENDS")
            module.depends.insert(word);
        else if (keyword == "SOURCES" && startsWith(word, fromRoot + "include/"))
            module.publicHeaders.insert(word.substr(fromRoot.size()));
    }
    m_modules.emplace(module.name, module);
}

std::vector<std::string> SourceTree::filesIn(const std::string &folder) const
{
    std::vector<std::string> files;
    for (const auto &[name, text] : m_texts) {
        if (startsWith(name, folder + '/'))
            files.push_back(name);
    }
    return files;
}

const std::string &SourceTree::text(const std::string &file) const
{
    return m_texts.at(file);
}

int SourceTree::lineCount(const std::string &file) const
{
    const std::string &content = text(file);
    return static_cast<int>(std::count(content.begin(), content.end(), '\n'));
}

std::vector<Include> SourceTree::includes(const std::string &file) const
{
    static const std::regex line("^[ \t]*#[ \t]*include[ \t]*([<\"])([^>\"]+)[>\"]");
    std::vector<Include> found;
    std::istringstream stream(text(file));
    std::smatch match;
    for (std::string content; std::getline(stream, content);) {
        if (std::regex_search(content, match, line))
            found.push_back({ match[2], match[1] == "\"" });
    }
    return found;
}

std::string SourceTree::resolved(const Include &include, const std::string &file) const
{
    const std::string beside = file.substr(0, file.rfind('/') + 1);
    const std::vector<std::string> places = include.isQuoted
        ? std::vector<std::string> { beside, "src/", "tests/", "include/" }
        : std::vector<std::string> { "include/", "src/" };
    for (const std::string &place : places) {
        if (m_texts.count(place + include.name))
            return place + include.name;
    }
    return {};
}

std::string SourceTree::roomOf(const std::string &file) const
{
    return moduleOf(file) + '/' + fs::path(file).stem().string();
}

std::string SourceTree::moduleOf(const std::string &file) const
{
    const Module *nearest = nullptr;
    for (const auto &[name, module] : m_modules) {
        if (module.publicHeaders.count(file))
            return name;
        if (startsWith(file, module.folder + '/')
            && (!nearest || module.folder.size() > nearest->folder.size()))
            nearest = &module;
    }
    return nearest ? nearest->name : std::string();
}

} // namespace penwick::test
