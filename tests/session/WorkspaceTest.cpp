#include "session/Workspace.h"

#include "support/PageRig.h"

#include <gtest/gtest.h>

#include <fstream>

namespace lumora {
namespace {

class WorkspaceTest : public ::testing::Test, protected PageRig {
protected:
    void make() {
        ASSERT_TRUE(workspace.MakeWorkspace().ok());
        ASSERT_TRUE(workspace.MakeCounterFolder().ok());
        ASSERT_TRUE(workspace.MakeOrderFolder().ok());
    }
    Workspace workspace{state, machine.files};
};

TEST_F(WorkspaceTest, MakesTheTreeOfAFreshDriveAndStartsAtNumberHundred) {
    state.MisparHazmana = u"77"_s;
    make();
    EXPECT_EQ(machine.files.folders(u"C:\\"_path), QStringList({"2000lumora", "vedron"}));
    EXPECT_EQ(machine.files.folders(WorkspacePaths::root(state)), QStringList({"!!000", "misgarot", "zmany"}));
    EXPECT_EQ(machine.files.folders(WorkspacePaths::zmany(state)), QStringList({"job_folder", "ktanim", "tempred"}));
    ASSERT_TRUE(workspace.CleanWorkspace(state.MisparHazmana).ok());
    EXPECT_EQ(state.MisparHazmana, u"100");
    EXPECT_EQ(read(u"C:\\2000lumora\\!!000\\mana.txt"_path), "1\r\n");
    ASSERT_TRUE(workspace.writeCounter().ok());
    EXPECT_EQ(read(WorkspacePaths::counter(state)), "101\r\n");
    ASSERT_TRUE(workspace.CleanWorkspace(state.MisparHazmana).ok());
    EXPECT_EQ(state.MisparHazmana, u"101");
    write(WorkspacePaths::counter(state), "108\r\n");
    ASSERT_TRUE(workspace.writeCounter().ok());
    EXPECT_EQ(read(WorkspacePaths::counter(state)), "108\r\n") << "the counter never goes back";
}

TEST_F(WorkspaceTest, NamesTheFolderThatCannotBeMade) {
    write(u"C:\\2000lumora"_path, "x");
    const Result<void> made = workspace.MakeWorkspace();
    ASSERT_FALSE(made.ok());
    EXPECT_TRUE(made.failure().message.contains(u"2000lumora")) << made.failure().message.toStdString();
    EXPECT_FALSE(workspace.MakeRootFolders());
    EXPECT_FALSE(workspace.CleanWorkspace(state.MisparHazmana).ok()) << "mana.txt has no folder to lie in";
}

TEST_F(WorkspaceTest, TakesWhatItCanOfADamagedCounter) {
    const struct {
        QByteArray stored;
        QString number;
    } cases[] = {
        {"105\r\n", "105"}, {"105\n", "105"}, {"105", "105"},       {"  42\r\n", "42"},
        {"007x\r\n", "7"},  {"rubbish", "0"}, {"\r\n105\r\n", "0"}, {"-5\r\n", "0"},
        {"12.7", "12"},     {"7 8", "7"},     {"", "55"},           {"99999999999999999999\r\n", "999999999"},
    };
    make();
    for (const auto& c : cases) {
        state.MisparHazmana = u"55"_s;
        write(WorkspacePaths::counter(state), c.stored);
        ASSERT_TRUE(workspace.CleanWorkspace(state.MisparHazmana).ok());
        EXPECT_EQ(state.MisparHazmana, c.number) << c.stored.toStdString();
    }
}

TEST_F(WorkspaceTest, CleansTheScratchFoldersAndNothingElse) {
    make();
    const QStringList gone = {"C:\\2000lumora\\zmany\\ktanim\\b.jpg",
                              "C:\\2000lumora\\zmany\\ktanim\\c.JPG",
                              "C:\\2000lumora\\zmany\\tempred\\d.jpg",
                              "C:\\2000lumora\\zmany\\job_folder\\e.txt",
                              "C:\\2000lumora\\zmany\\job_folder\\f.BMP",
                              "C:\\2000lumora\\!!000\\^^^.jpg",
                              "C:\\2000lumora\\!!000\\g.gbr",
                              "C:\\2000lumora\\!!000\\h.gbx",
                              "C:\\2000lumora\\!!000\\111.jpg"};
    const QStringList kept = {"C:\\2000lumora\\zmany\\ktanim\\a.Jpg",    "C:\\2000lumora\\zmany\\ktanim\\b.bmp",
                              "C:\\2000lumora\\zmany\\tempred\\000.bmp", "C:\\2000lumora\\pratim.txt",
                              "C:\\2000lumora\\!!000\\kept.jpp",         "C:\\2000lumora\\000.jpg"};
    for (const QString& path : gone + kept)
        write(DrivePath(path), "x");
    // A name outside the code page lists with a "?", under which there is no file.
    const HostPath odd = *machine.drives.toHost(WorkspacePaths::ktanim(state)) / "!\xE6\xBC\xA2.jpg";
    std::ofstream(odd) << "x";
    ASSERT_TRUE(workspace.CleanWorkspace(state.MisparHazmana).ok());
    EXPECT_TRUE(std::filesystem::exists(odd));
    for (const QString& path : gone)
        EXPECT_FALSE(machine.files.fileExists(DrivePath(path))) << path.toStdString();
    for (const QString& path : kept)
        EXPECT_TRUE(machine.files.fileExists(DrivePath(path))) << path.toStdString();
}

} // namespace
} // namespace lumora
