// Folders, files, modification times and the writes that never leave a half-written file.
#include "host/core/DateTime.h"
#include "host/core/Dir.h"
#include "host/core/Error.h"
#include "host/core/ErrorTable.h"
#include "host/core/File.h"
#include "host/core/FileTimes.h"
#include "host/core/FileUtils.h"
#include "support/FileSizeLimit.h"
#include "support/TempDir.h"

#include <boost/date_time/posix_time/time_formatters.hpp>

#include <cstdlib>
#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/stat.h>

using orvcore::filesupport::Dir;
using orvcore::filesupport::File;
using orvcore::utility::FileUtils;
using orvcore::utility::ToIsoString;
using orvtest::TempDir;
namespace fs = std::filesystem;

namespace {

// Sets or clears an environment variable for one test, restoring it afterwards.
class ScopedEnv {
public:
    ScopedEnv(char const* name, char const* value)
        : name_(name) {
        if (char const* old = std::getenv(name)) {
            old_ = old;
            hadOld_ = true;
        }
        value ? ::setenv(name, value, 1) : ::unsetenv(name);
    }
    ~ScopedEnv() { hadOld_ ? ::setenv(name_, old_.c_str(), 1) : ::unsetenv(name_); }

private:
    char const* name_;
    std::string old_;
    bool hadOld_ = false;
};

void SetModified(fs::path const& p, long seconds, long nanoseconds) {
    struct timespec times[2] = {{seconds, nanoseconds}, {seconds, nanoseconds}};
    ASSERT_EQ(::utimensat(AT_FDCWD, p.c_str(), times, 0), 0);
}

} // namespace

TEST(PrefDir, EnvironmentDecidesAndFolderIsCreated) {
    TempDir tmp;
    {
        ScopedEnv own("ORV_PREFS_DIR", (tmp.Path() / "own").c_str());
        ScopedEnv xdg("XDG_CONFIG_HOME", (tmp.Path() / "xdg").c_str());
        EXPECT_EQ(Dir::PrefDir().Path(), tmp.Path() / "own");
        EXPECT_TRUE(fs::is_directory(tmp.Path() / "own"));
    }
    {
        ScopedEnv own("ORV_PREFS_DIR", "");
        ScopedEnv xdg("XDG_CONFIG_HOME", (tmp.Path() / "xdg").c_str());
        EXPECT_EQ(Dir::PrefDir().Path(), tmp.Path() / "xdg" / "orvworkspace");
    }
    {
        ScopedEnv own("ORV_PREFS_DIR", nullptr);
        ScopedEnv xdg("XDG_CONFIG_HOME", nullptr);
        ScopedEnv home("HOME", (tmp.Path() / "home").c_str());
        EXPECT_EQ(Dir::PrefDir().Path(), tmp.Path() / "home" / ".config" / "orvworkspace");
        EXPECT_TRUE(Dir::PrefDir().Exists());
    }
}

TEST(DirAndFile, NamesAndExistence) {
    TempDir tmp;
    Dir saved(Dir(tmp.U16()), u"SavedWorkspaces");
    EXPECT_EQ(Dir(u"/a/b").FullPath(), u"/a/b");
    EXPECT_FALSE(saved.Exists());
    EXPECT_TRUE(saved.Create());
    EXPECT_TRUE(saved.Exists());
    File f(saved, u"UserWorkspace1.xml");
    EXPECT_EQ(f.GetName(), u"UserWorkspace1.xml");
    EXPECT_EQ(f.GetExtension(), u".xml");
    EXPECT_EQ(File(u"/a/b/noext").GetExtension(), u"");
    EXPECT_FALSE(f.Exists());
    EXPECT_TRUE(f.Modified().is_not_a_date_time());
    EXPECT_TRUE(FileUtils::CreateNewFile(f.FullPath()));
    EXPECT_TRUE(f.Exists());
    EXPECT_FALSE(File(saved.FullPath()).Exists()); // a folder is not a file
}

TEST(DirAndFile, NonAsciiNamesSurviveTheTrip) {
    TempDir tmp;
    std::u16string name = u"Espa\u00F1ol \U0001F3AC.xml";
    std::u16string path;
    FileUtils::BuildPathSpec(tmp.U16(), name, path);
    EXPECT_TRUE(FileUtils::CreateNewFile(path));
    std::vector<std::u16string> list;
    ASSERT_TRUE(FileUtils::ContainedFiles(tmp.U16(), list));
    ASSERT_EQ(list.size(), 1u);
    EXPECT_EQ(list[0], path);
    EXPECT_EQ(File(list[0]).GetName(), name);
}

TEST(FileUtils, ModificationTimeAsIsoText) {
    TempDir tmp;
    fs::path p = tmp.Write("w.xml", "x");
    SetModified(p, 1767323045, 123456789); // 2026-01-02 03:04:05.123456789 UTC
    EXPECT_EQ(ToIsoString(File(TempDir::PathU16(p)).Modified()), "20260102T030405,123456");
    SetModified(p, 1767323045, 0);
    EXPECT_EQ(ToIsoString(File(TempDir::PathU16(p)).Modified()), "20260102T030405");
    EXPECT_EQ(ToIsoString(File(tmp.U16("absent")).Modified()), "not-a-date-time");
    // Small fractions keep their leading zeros, and the text is the library's with a comma.
    SetModified(p, 946684799, 5000); // 1999-12-31 23:59:59.000005
    EXPECT_EQ(ToIsoString(File(TempDir::PathU16(p)).Modified()), "19991231T235959,000005");
    boost::posix_time::ptime t = File(TempDir::PathU16(p)).Modified();
    std::string library = boost::posix_time::to_iso_string(t);
    library[library.find('.')] = ',';
    EXPECT_EQ(ToIsoString(t), library);
}

TEST(FileUtils, UniqueFileNameSkipsTakenNamesAndCreateNewFileRefusesThem) {
    TempDir tmp;
    std::u16string first = FileUtils::UniqueFileName(tmp.U16(), u"UserWorkspace", u".xml");
    EXPECT_EQ(first, tmp.U16("UserWorkspace1.xml"));
    EXPECT_TRUE(FileUtils::CreateNewFile(first));
    EXPECT_FALSE(FileUtils::CreateNewFile(first));
    tmp.Write("UserWorkspace2.xml", "");
    fs::create_directory(tmp.Path() / "UserWorkspace3.xml"); // a folder takes the name too
    EXPECT_EQ(FileUtils::UniqueFileName(tmp.U16(), u"UserWorkspace", u".xml"), tmp.U16("UserWorkspace4.xml"));
    EXPECT_FALSE(FileUtils::CreateNewFile(tmp.U16("missing/folder.xml")));
    // A dangling link still takes its name: creating a file there would fail.
    fs::create_symlink(tmp.Path() / "nowhere", tmp.Path() / "UserWorkspace4.xml");
    EXPECT_EQ(FileUtils::UniqueFileName(tmp.U16(), u"UserWorkspace", u".xml"), tmp.U16("UserWorkspace5.xml"));
}

TEST(FileUtils, ContainedFilesListsOnlyFilesInNameOrder) {
    TempDir tmp;
    tmp.Write("b.xml", "");
    tmp.Write("B.xml", "");
    tmp.Write("a.txt", "");
    fs::create_directory(tmp.Path() / "c.xml");
    std::vector<std::u16string> list{u"stale"};
    ASSERT_TRUE(FileUtils::ContainedFiles(tmp.U16(), list));
    EXPECT_EQ(list, (std::vector<std::u16string>{tmp.U16("B.xml"), tmp.U16("a.txt"), tmp.U16("b.xml")}));
    EXPECT_FALSE(FileUtils::ContainedFiles(tmp.U16("nowhere"), list));
    EXPECT_TRUE(list.empty());
    EXPECT_FALSE(FileUtils::ContainedFiles(u"", list));
}

TEST(FileUtils, ContainedFilesCountsLinksByWhatTheyLeadTo) {
    TempDir tmp;
    fs::path target = tmp.Write("target.xml", "");
    fs::create_directory(tmp.Path() / "folder");
    fs::create_symlink(target, tmp.Path() / "to-file.xml");
    fs::create_symlink(tmp.Path() / "folder", tmp.Path() / "to-folder.xml");
    fs::create_symlink(tmp.Path() / "gone", tmp.Path() / "dangling.xml");
    std::vector<std::u16string> list;
    // A trailing separator on the folder gives the same paths.
    ASSERT_TRUE(FileUtils::ContainedFiles(tmp.U16() + u"/", list));
    EXPECT_EQ(list, (std::vector<std::u16string>{tmp.U16("target.xml"), tmp.U16("to-file.xml")}));
}

TEST(FileUtils, ModifiedTimesAgreeWithEachFilesOwn) {
    TempDir tmp;
    fs::create_directory(tmp.Path() / "one");
    fs::create_directory(tmp.Path() / "two");
    std::vector<std::u16string> paths;
    long seconds = 1767323045;
    // Folders alternate and come back, so an open folder must never answer for another one.
    for (char const* name : {"one/a.xml", "one/b.xml", "two/a.xml", "one/c.xml", "two/b.xml"}) {
        fs::path p = tmp.Write(name, "x");
        SetModified(p, seconds++, 0);
        paths.push_back(TempDir::PathU16(p));
    }
    paths.push_back(tmp.U16("one/absent.xml"));
    paths.push_back(tmp.U16("missing-folder/a.xml"));
    paths.push_back(u"");
    std::vector<boost::posix_time::ptime> times = orvcore::filesupport::ModifiedTimes(paths);
    ASSERT_EQ(times.size(), paths.size());
    for (std::size_t i = 0; i < paths.size(); ++i) {
        EXPECT_EQ(ToIsoString(times[i]), ToIsoString(File(paths[i]).Modified())) << i;
    }
    EXPECT_EQ(ToIsoString(times[2]), "20260102T030407");
    EXPECT_TRUE(times[5].is_special());
    EXPECT_TRUE(times[6].is_special());
    EXPECT_TRUE(times[7].is_special());
}

TEST(FileUtils, CopyRemoveAndExistence) {
    TempDir tmp;
    fs::path from = tmp.Write("from.xml", "new content");
    fs::path to = tmp.Write("to.xml", "old");
    ::chmod(to.c_str(), 0640);
    EXPECT_TRUE(FileUtils::Copy(TempDir::PathU16(from), TempDir::PathU16(to)));
    EXPECT_EQ(orvtest::ReadFile(to), "new content");
    EXPECT_EQ(fs::status(to).permissions() & fs::perms::all,
              fs::perms::owner_read | fs::perms::owner_write | fs::perms::group_read);
    EXPECT_FALSE(FileUtils::Copy(tmp.U16("absent.xml"), TempDir::PathU16(to)));
    EXPECT_EQ(orvtest::ReadFile(to), "new content");
    // A source that opens but fails to read (this one answers every read with an I/O error) must
    // not replace the target with a truncated copy.
    EXPECT_FALSE(FileUtils::Copy(u"/proc/self/mem", TempDir::PathU16(to)));
    EXPECT_EQ(orvtest::ReadFile(to), "new content");

    EXPECT_TRUE(FileUtils::FileExists(TempDir::PathU16(to)));
    EXPECT_FALSE(FileUtils::DirectoryExists(TempDir::PathU16(to)));
    EXPECT_TRUE(FileUtils::DirectoryExists(tmp.U16()));
    EXPECT_TRUE(FileUtils::RemoveFile(TempDir::PathU16(to)));
    EXPECT_FALSE(FileUtils::RemoveFile(TempDir::PathU16(to)));
    EXPECT_FALSE(FileUtils::RemoveFile(tmp.U16())); // never a folder
    EXPECT_TRUE(fs::exists(tmp.Path()));

    ::chmod(from.c_str(), 0444);
    EXPECT_TRUE(FileUtils::RemoveReadOnlyAttribute(TempDir::PathU16(from)));
    EXPECT_NE(fs::status(from).permissions() & fs::perms::owner_write, fs::perms::none);
    EXPECT_FALSE(FileUtils::RemoveReadOnlyAttribute(tmp.U16("absent")));
    // Nothing but the two files the test made is left behind.
    EXPECT_EQ(std::distance(fs::directory_iterator(tmp.Path()), fs::directory_iterator()), 1);
}

TEST(FileUtils, ReadWholeFileRefusesOversizedAndMissingFiles) {
    TempDir tmp;
    fs::path p = tmp.Write("small", "12345");
    EXPECT_EQ(FileUtils::ReadWholeFile(TempDir::PathU16(p), 5), "12345");
    try {
        FileUtils::ReadWholeFile(TempDir::PathU16(p), 4);
        FAIL() << "a file over the limit was read";
    } catch (orvcore::config::Error const& e) {
        EXPECT_EQ(e.Entry(), orvcore::config::FindErrorEntry(110, 21));
        EXPECT_NE(e.Message().find(u"small"), std::u16string::npos);
    }
    EXPECT_THROW(FileUtils::ReadWholeFile(tmp.U16("absent"), 100), orvcore::config::Error);
    EXPECT_THROW(FileUtils::ReadWholeFile(tmp.U16(), 100), orvcore::config::Error);
    // A FIFO in a document's place is refused at once instead of waiting for a writer.
    ASSERT_EQ(::mkfifo((tmp.Path() / "fifo").c_str(), 0600), 0);
    EXPECT_THROW(FileUtils::ReadWholeFile(tmp.U16("fifo"), 100), orvcore::config::Error);
}

TEST(FileUtils, FailedWriteLeavesThePreviousFileWhole) {
    TempDir tmp;
    fs::path target = tmp.Write("doc.xml", "the previous document");
    bool raised = false;
    ASSERT_TRUE(orvtest::WithFileSizeLimit(1000, [&] {
        try {
            FileUtils::WriteFileAtomically(TempDir::PathU16(target), std::string(5000, 'x'));
        } catch (orvcore::config::Error const& e) {
            raised = e.Code() == 22 && e.Facility() == 110;
        }
    }));
    EXPECT_TRUE(raised);
    EXPECT_EQ(orvtest::ReadFile(target), "the previous document");
    EXPECT_EQ(std::distance(fs::directory_iterator(tmp.Path()), fs::directory_iterator()), 1)
        << "the temporary file was left behind";

    FileUtils::WriteFileAtomically(TempDir::PathU16(target), "replaced");
    EXPECT_EQ(orvtest::ReadFile(target), "replaced");
    EXPECT_THROW(FileUtils::WriteFileAtomically(tmp.U16("no/such/folder.xml"), "x"), orvcore::config::Error);
}
