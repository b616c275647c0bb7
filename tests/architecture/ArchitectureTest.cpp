// SPDX-License-Identifier: MIT
// Who may know whom, held against what the files really include.
#include "architecture/SourceTree.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <regex>
#include <sstream>

namespace penwick::test {

namespace {

using Findings = std::vector<std::string>;

const SourceTree &tree()
{
    static const SourceTree sources(PENWICK_SOURCE_TREE);
    return sources;
}

Findings files(const std::vector<std::string> &folders)
{
    Findings all;
    for (const std::string &folder : folders) {
        const auto found = tree().filesIn(folder);
        all.insert(all.end(), found.begin(), found.end());
    }
    return all;
}

bool isBelow(const std::string &file, const std::string &folder)
{
    return file.compare(0, folder.size() + 1, folder + '/') == 0;
}

bool endsWith(const std::string &text, const std::string &end)
{
    return text.size() >= end.size()
        && text.compare(text.size() - end.size(), end.size(), end) == 0;
}

/// "file: line" for every line of `folders` that `pattern` is found in, but those of `except`.
Findings linesLike(
    const std::string &pattern, const std::vector<std::string> &folders, const std::string &except)
{
    const std::regex expression(pattern);
    Findings findings;
    for (const std::string &file : files(folders)) {
        if (isBelow(file, except))
            continue;
        std::istringstream stream(tree().text(file));
        for (std::string line; std::getline(stream, line);) {
            if (std::regex_search(line, expression))
                findings.push_back(file + ": " + line);
        }
    }
    return findings;
}

/// Walks along `next` from `start` and finds every step that leads back to where the walk has been.
class CircleFinder
{
public:
    using Next = std::function<std::vector<std::string>(const std::string &)>;

    explicit CircleFinder(Next next)
        : m_next(std::move(next))
    { }

    void walk(const std::string &start)
    {
        if (std::find(m_path.begin(), m_path.end(), start) != m_path.end()) {
            std::string circle = start;
            for (auto step = m_path.rbegin(); step != m_path.rend() && *step != start; ++step)
                circle = *step + " -> " + circle;
            m_circles.push_back(start + " -> " + circle);
            return;
        }
        if (!m_seen.insert(start).second)
            return;
        m_path.push_back(start);
        for (const std::string &following : m_next(start))
            walk(following);
        m_path.pop_back();
    }

    [[nodiscard]] const Findings &circles() const { return m_circles; }

private:
    Next m_next;
    std::vector<std::string> m_path;
    std::set<std::string> m_seen;
    Findings m_circles;
};

const std::string nativeInclude
    = "#\\s*include\\s*[<\"](xcb/|X11/|windows\\.h|windowsx\\.h|dwmapi\\.h|winuser\\.h|Cocoa/"
      "|AppKit/"
      "|Foundation/|CoreGraphics/|ApplicationServices/|objc/|sys/|unistd\\.h|dlfcn\\.h|wayland)";
const std::string privateQtInclude = "#\\s*include\\s*[<\"](qpa/|.*private/|.*_p\\.h)";
const std::string desktopQuestion
    = "Q_OS_|__APPLE__|_WIN32|__linux__|Q_WS_|QNativeInterface|nativeInterface\\s*<"
      "|platformName|\"xcb\"|QDBus";

} // namespace

TEST(Architecture, treeWasFound)
{
    EXPECT_GE(tree().modules().size(), 7U);
    EXPECT_EQ(tree().modules().count("foundation"), 1U);
    EXPECT_EQ(tree().modules().at("foundation").folder, "src/platform/foundation");
    EXPECT_EQ(tree().moduleOf("src/platform/foundation/FatalError.h"), "foundation");
    EXPECT_EQ(tree().moduleOf("src/platform/view/View.h"), "view");
    EXPECT_EQ(tree().moduleOf("include/penwick/platform/Window.h"), "window");
    EXPECT_EQ(tree().moduleOf("include/penwick/platform/NotificationCenter.h"), "foundation");
    EXPECT_EQ(tree().moduleOf("include/penwick/Penwick.h"), "session");
    EXPECT_EQ(tree().roomOf("src/platform/window/Window.cpp"), "window/Window");
    EXPECT_EQ(tree().roomOf("include/penwick/platform/Window.h"), "window/Window");
}

TEST(Architecture, foldersIncludeOnlyWhatTheyDependOn)
{
    Findings findings;
    for (const std::string &file : files({ "src", "include" })) {
        const std::string own = tree().moduleOf(file);
        ASSERT_NE(own, "") << file << " belongs to no module";
        const Module &module = tree().modules().at(own);
        for (const Include &include : tree().includes(file)) {
            const std::string target = tree().resolved(include, file);
            const std::string other = target.empty() ? std::string() : tree().moduleOf(target);
            if (!other.empty() && other != own && !module.depends.count(other))
                findings.push_back(file + " includes " + include.name + " of " + other);
        }
    }

    EXPECT_EQ(findings, Findings {});
}

TEST(Architecture, quotedIncludesOfTheComponentAreItsOwnFiles)
{
    Findings findings;
    for (const std::string &file : files({ "src", "include" })) {
        for (const Include &include : tree().includes(file)) {
            const bool isMade
                = include.name.compare(0, 3, "ui_") == 0 || endsWith(include.name, ".moc");
            const std::string target = tree().resolved(include, file);
            const bool isOwn = isBelow(target, "src") || isBelow(target, "include");
            if (include.isQuoted && !isMade && !isOwn)
                findings.push_back(file + " includes " + include.name);
        }
    }

    EXPECT_EQ(findings, Findings {});
}

TEST(Architecture, foldersDependOnOneAnotherOneWay)
{
    CircleFinder finder([](const std::string &name) {
        const auto found = tree().modules().find(name);
        if (found == tree().modules().end()) {
            ADD_FAILURE() << "there is no module " << name;
            return std::vector<std::string> {};
        }
        return std::vector<std::string>(found->second.depends.begin(), found->second.depends.end());
    });

    for (const auto &[name, module] : tree().modules())
        finder.walk(name);

    EXPECT_EQ(finder.circles(), Findings {});
}

TEST(Architecture, platformStandsInFiveFloors)
{
    const std::vector<std::string> floors { "foundation", "native", "view", "window", "scene" };
    std::set<std::string> below;
    Findings findings;
    for (const std::string &name : floors) {
        ASSERT_EQ(tree().modules().count(name), 1U) << name;
        EXPECT_EQ(tree().modules().at(name).folder, "src/platform/" + name);
        for (const std::string &known : tree().modules().at(name).depends) {
            if (!below.count(known))
                findings.push_back(name + " depends on " + known);
        }
        below.insert(name);
    }
    for (const auto &[name, module] : tree().modules()) {
        if (isBelow(module.folder, "src/platform") && !below.count(name))
            findings.push_back(name + " is on no floor");
    }

    EXPECT_EQ(findings, Findings {});
}

// A header and its sources are one room: what the source includes, the header's class knows.
TEST(Architecture, roomsOfAFolderKnowOneAnotherOneWay)
{
    std::map<std::string, std::set<std::string>> known;
    for (const std::string &file : files({ "src", "include" })) {
        std::set<std::string> &others = known[tree().roomOf(file)];
        for (const Include &include : tree().includes(file)) {
            const std::string target = tree().resolved(include, file);
            if (!target.empty() && tree().moduleOf(target) == tree().moduleOf(file))
                others.insert(tree().roomOf(target));
        }
        others.erase(tree().roomOf(file));
    }
    CircleFinder finder([&known](const std::string &room) {
        return std::vector<std::string>(known[room].begin(), known[room].end());
    });

    for (const std::string &file : files({ "src", "include" }))
        finder.walk(tree().roomOf(file));

    EXPECT_GE(known["view/View"].size(), 4U);
    EXPECT_EQ(known["window/Window"].count("window/WindowParts"), 1U); // by its source alone
    EXPECT_EQ(finder.circles(), Findings {});
}

TEST(Architecture, noFileIncludesItselfOnADetour)
{
    CircleFinder finder([](const std::string &file) {
        std::vector<std::string> targets;
        for (const Include &include : tree().includes(file)) {
            const std::string target = tree().resolved(include, file);
            if (!target.empty())
                targets.push_back(target);
        }
        return targets;
    });

    for (const std::string &file :
        files({ "include", "src", "host", "examples", "tests", "bench" }))
        finder.walk(file);

    EXPECT_EQ(finder.circles(), Findings {});
}

TEST(Architecture, publicHeadersIncludeOnlyPublicOnesAndQt)
{
    Findings findings;
    for (const std::string &file : files({ "include" })) {
        for (const Include &include : tree().includes(file)) {
            const bool isPublic = include.name.compare(0, 8, "penwick/") == 0;
            const bool isSystem = !include.isQuoted && tree().resolved(include, file).empty();
            if (!isPublic && !isSystem)
                findings.push_back(file + " includes " + include.name);
        }
    }

    EXPECT_EQ(findings, Findings {});
}

TEST(Architecture, exampleHostKnowsOnlyWhatAnyHostMay)
{
    Findings findings;
    for (const std::string &file : files({ "host" })) {
        for (const Include &include : tree().includes(file)) {
            const std::string target = tree().resolved(include, file);
            const bool isPublic = !include.isQuoted && isBelow(target, "include");
            const bool isOwn = include.isQuoted && isBelow(target, "host");
            const bool isSystem = !include.isQuoted && target.empty();
            if (!isPublic && !isOwn && !isSystem)
                findings.push_back(file + " includes " + include.name);
        }
    }

    EXPECT_EQ(findings, Findings {});
}

TEST(Architecture, examplesKnowOnlyWhatIsInstalled)
{
    Findings findings;
    for (const std::string &file : files({ "examples" })) {
        const std::string folder = file.substr(0, file.rfind('/'));
        for (const Include &include : tree().includes(file)) {
            const std::string target = tree().resolved(include, file);
            const bool isPublic = !include.isQuoted && isBelow(target, "include");
            const bool isOwn = include.isQuoted && isBelow(target, folder);
            const bool isSystem = !include.isQuoted && target.empty();
            if (!isPublic && !isOwn && !isSystem)
                findings.push_back(file + " includes " + include.name);
        }
    }

    EXPECT_FALSE(files({ "examples" }).empty());
    EXPECT_EQ(findings, Findings {});
}

TEST(Architecture, desktopsAreToldApartOnlyInPlatform)
{
    // Capturing the screen, which examples/capture shows, is a host's own native business.
    const std::vector<std::string> product { "src", "include", "host", "examples/embed" };

    EXPECT_FALSE(files({ "examples/embed" }).empty());
    EXPECT_EQ(linesLike(nativeInclude, product, "src/platform"), Findings {});
    EXPECT_EQ(linesLike(privateQtInclude, product, "src/platform"), Findings {});
    EXPECT_EQ(linesLike(desktopQuestion, product, "src/platform"), Findings {});
}

TEST(Architecture, nativeCallsAreOnlyInTheNativeFolder)
{
    const std::vector<std::string> platform { "src/platform" };

    EXPECT_EQ(linesLike(nativeInclude, platform, "src/platform/native"), Findings {});
    EXPECT_EQ(linesLike(privateQtInclude, platform, "src/platform/native"), Findings {});
    EXPECT_EQ(linesLike(desktopQuestion, platform, "src/platform/native"), Findings {});
}

TEST(Architecture, everyFileSaysItsLicenceAndItsPurposeFirst)
{
    Findings findings;
    for (const std::string &file :
        files({ "include", "src", "host", "examples", "tests", "bench" })) {
        const std::string &text = tree().text(file);
        if (text.compare(0, 32, "// SPDX-License-Identifier: MIT\n") != 0)
            findings.push_back(file + ": no licence line");
        if (endsWith(file, ".h") && text.compare(32, 3, "// ") != 0)
            findings.push_back(file + ": no purpose");
        if (endsWith(file, ".h") && text.find("\n#pragma once\n") == std::string::npos)
            findings.push_back(file + ": no #pragma once");
    }

    EXPECT_EQ(findings, Findings {});
}

TEST(Architecture, noFileIsLongerThanWasAgreed)
{
    constexpr int limit = 400;
    // Files that may be longer, each with the reason. No reason allows more than 600 lines.
    const std::set<std::string> agreed {};
    Findings findings;
    for (const std::string &file :
        files({ "include", "src", "host", "examples", "tests", "bench" })) {
        const int lines = tree().lineCount(file);
        if (lines > limit && (!agreed.count(file) || lines > 600))
            findings.push_back(file + ": " + std::to_string(lines));
    }

    EXPECT_EQ(findings, Findings {});
}

} // namespace penwick::test
