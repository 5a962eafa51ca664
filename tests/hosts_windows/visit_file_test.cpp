#include "hosts/windows/visit_file.hpp"

#include <gtest/gtest.h>

#include <cassert>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <utility>

#include "child_process.hpp"
#include "hosts/headless/visit_player.hpp"

// Where the linker has put the address of the system's function that writes to a file.
extern "C" decltype(&WriteFile) __imp_WriteFile;

namespace quabble {
namespace {

namespace fs = std::filesystem;

// A program in which somebody has begun a game.
struct Recorded {
    HeadlessFrontEnd frontEnd;
    MemoryBlob kept;
    BlobRegistryStore registry{kept};
    Program program{frontEnd, registry, 5};
    ScriptedUser<Program> user{frontEnd, program};
    VisitFile file{program};

    Recorded() {
        program.start();
        user.wait(std::chrono::seconds(3));
        user.click(337, 67);
    }
};

// The user's own folder is one of the test's.
class VisitFileTest : public testing::Test {
 protected:
    VisitFileTest() { SetEnvironmentVariableW(L"LOCALAPPDATA", folder.c_str()); }
    ~VisitFileTest() override { fs::remove_all(folder); }

    std::string written() const {
        std::ifstream stream(folder / "Quabble" / "last_game.visit", std::ios::binary);
        return {std::istreambuf_iterator<char>(stream), {}};
    }

    fs::path folder =
        fs::temp_directory_path() / (L"J\u00FCrgen \u2603" + std::to_wstring(GetCurrentProcessId()));
};

int writes = 0;
decltype(&WriteFile) reallyWrite = nullptr;
BOOL WINAPI writeThreeTimes(HANDLE file, LPCVOID bytes, DWORD size, LPDWORD written,
                            LPOVERLAPPED overlapped) {
    return ++writes <= 3 ? reallyWrite(file, bytes, size, written, overlapped) : FALSE;
}

TEST_F(VisitFileTest, AFullDiskLeavesTheOlderRecord) {
    fs::create_directory(folder);
    Recorded recorded;
    ASSERT_TRUE(recorded.file.write());
    const std::string before = written();
    EXPECT_TRUE(std::holds_alternative<Visit>(parseVisit(before))) << before;
    recorded.user.movePointer(300, 100);
    recorded.user.press('p');
    DWORD protection = 0;
    VirtualProtect(&__imp_WriteFile, sizeof __imp_WriteFile, PAGE_READWRITE, &protection);
    reallyWrite = std::exchange(__imp_WriteFile, writeThreeTimes);
    EXPECT_FALSE(recorded.file.write());
    __imp_WriteFile = reallyWrite;
    EXPECT_GT(writes, 3);
    EXPECT_EQ(written(), before);
    EXPECT_TRUE(recorded.file.write());
    EXPECT_NE(written(), before);
    EXPECT_EQ(std::distance(fs::directory_iterator(folder / "Quabble"), {}), 1)
        << "nothing is left beside it";
}

TEST(VisitFileChild, DISABLED_BreakAnInvariant) {
    const Recorded recorded;
    assert(recorded.program.ended());
}

TEST_F(VisitFileTest, ABrokenInvariantWritesTheRecord) {
    fs::create_directory(folder);
    EXPECT_EQ(runInChild(L"DISABLED_BreakAnInvariant"), 3U) << "it ends as a process that aborts";
    EXPECT_NE(written().find(" press 337 67"), std::string::npos) << written();
    EXPECT_NE(written().find("\nexpect level"), std::string::npos);
}

}  // namespace
}  // namespace quabble
