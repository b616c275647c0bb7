// SPDX-License-Identifier: MIT
// The source tree as the rules about it see it: files, their includes, and the modules.
#pragma once

#include <map>
#include <set>
#include <string>
#include <vector>

namespace penwick::test {

/// One #include of a file.
struct Include
{
    std::string name; ///< as it is written, without the quotes or angle brackets
    bool isQuoted = false;
};

/// One folder under src/ that penwick_add_module() makes a target of.
struct Module
{
    std::string name;
    std::string folder; ///< from the root, for example "src/platform/foundation"
    std::set<std::string> depends; ///< names of the modules whose headers it may include
    std::set<std::string> publicHeaders; ///< those of include/ that its sources name
};

/// The text files of the project, read when it is made. Paths are from the root, with slashes.
class SourceTree
{
public:
    explicit SourceTree(const std::string &root);

    /// C++ files below `folder`, in order of their paths.
    [[nodiscard]] std::vector<std::string> filesIn(const std::string &folder) const;
    [[nodiscard]] const std::string &text(const std::string &file) const;
    [[nodiscard]] int lineCount(const std::string &file) const;
    [[nodiscard]] std::vector<Include> includes(const std::string &file) const;
    /// The file of the project that `include`, written in `file`, means; empty for a header of the
    /// system or one that the build makes.
    [[nodiscard]] std::string resolved(const Include &include, const std::string &file) const;

    /// All modules, by name.
    [[nodiscard]] const std::map<std::string, Module> &modules() const { return m_modules; }
    /// Name of the module that `file` belongs to. A public header belongs to the module that
    /// names it among its sources. Empty for what belongs to none.
    [[nodiscard]] std::string moduleOf(const std::string &file) const;
    /// Name of the room that `file` belongs to, which is a header with the sources of its name:
    /// "module/name".
    [[nodiscard]] std::string roomOf(const std::string &file) const;

private:
    void readModule(const std::string &file, const std::string &text);

    std::map<std::string, std::string> m_texts;
    std::map<std::string, Module> m_modules;
};

} // namespace penwick::test
