// SPDX-License-Identifier: Apache-2.0
//
// Links from their bytes. Where the host makes none, these are all that can be had.

#include "support/src/windows_links.h"

#include "tests/unit/support/host_fixture.h"

#include <cstdint>
#include <cstring>
#include <windows.h>

namespace support {

namespace {

constexpr uint32_t SymbolicLink = 0xA000000C;
constexpr uint32_t MountPoint = 0xA0000003;

class LinkBytes {
public:
  explicit LinkBytes(uint32_t kind) { add(kind).add(uint32_t{0}); }

  LinkBytes& names(std::wstring_view followed, std::wstring_view seen) {
    const auto followedSize = static_cast<uint16_t>(followed.size() * sizeof(wchar_t));
    const auto seenSize = static_cast<uint16_t>(seen.size() * sizeof(wchar_t));
    add(uint16_t{0}).add(followedSize).add(followedSize).add(seenSize).add(uint32_t{0});
    for (const wchar_t unit : followed)
      add(unit);
    for (const wchar_t unit : seen)
      add(unit);
    return *this;
  }

  std::span<const std::byte> get() const { return m_Bytes; }

private:
  template <class Number>
  LinkBytes& add(Number number) {
    m_Bytes.resize(m_Bytes.size() + sizeof number);
    std::memcpy(m_Bytes.data() + m_Bytes.size() - sizeof number, &number, sizeof number);
    return *this;
  }

  std::vector<std::byte> m_Bytes;
};

} // namespace

TEST(LinkText, IsWhatUsersSee) {
  EXPECT_EQ(linkTextFrom(LinkBytes(SymbolicLink).names(L"\\??\\C:\\dir\\a", L"C:\\dir\\a").get()),
            L"C:\\dir\\a");
  EXPECT_EQ(linkTextFrom(LinkBytes(SymbolicLink).names(L"..\\\u8868", L"..\\\u8868").get()),
            L"..\\\u8868");
}

TEST(LinkText, IsElseWhatTheSystemFollows) {
  EXPECT_EQ(linkTextFrom(LinkBytes(SymbolicLink).names(L"\\??\\C:\\dir\\a", L"").get()),
            L"\\\\?\\C:\\dir\\a");
  EXPECT_EQ(linkTextFrom(LinkBytes(SymbolicLink).names(L"a.o", L"").get()), L"a.o");
}

TEST(LinkText, IsEmptyForWhatIsNoSymbolicLink) {
  EXPECT_EQ(linkTextFrom(LinkBytes(MountPoint).names(L"a", L"a").get()), L"");
  EXPECT_EQ(linkTextFrom({}), L"");
}

TEST(LinkText, IsEmptyForEveryBeginningOfALink) {
  const LinkBytes link = LinkBytes(SymbolicLink).names(L"", L"abc");
  for (size_t size = 0; size < link.get().size(); ++size)
    EXPECT_EQ(linkTextFrom(link.get().first(size)), L"") << size;
  EXPECT_EQ(linkTextFrom(link.get()), L"abc");
}

class WindowsLinkTest : public HostTest {
protected:
  // False where the host makes no links, or not for this user.
  bool link(const std::string& leaf, const wchar_t* target) {
    constexpr DWORD AlsoForOrdinaryUsers = 2;
    return CreateSymbolicLinkW(pathOf(leaf).c_str(), target, AlsoForOrdinaryUsers) != 0 &&
           !readLink(pathOf(leaf).wstring()).empty();
  }
};

TEST_F(WindowsLinkTest, AreFollowedToTheirEnd) {
  make("file", "text");
  const std::filesystem::path file = pathOf("file");
  if (!link("one", L"file") || !link("two", L"one") || !link("absolute", file.c_str()) ||
      !link("dangling", L"nowhere") || !link("a", L"b") || !link("b", L"a"))
    GTEST_SKIP() << "this host makes no links";
  const std::string folder = textFrom(m_Folder) + "\\";
  const auto follow = [&](const char* leaf) { return m_Host.followLinks((folder + leaf).c_str()); };
  EXPECT_EQ(follow("one"), folder + "file");
  EXPECT_EQ(follow("two"), folder + "file");
  EXPECT_EQ(follow("absolute"), textFrom(file));
  EXPECT_EQ(follow("dangling"), folder + "nowhere");
  EXPECT_EQ(follow("a"), folder + "a");
  FileStatus status;
  FileStatus through;
  EXPECT_EQ(m_Host.status((folder + "file").c_str(), status), 0);
  EXPECT_EQ(m_Host.status((folder + "two").c_str(), through), 0);
  EXPECT_TRUE(through.isSameFile(status));
  EXPECT_EQ(m_Host.status((folder + "a").c_str(), status), ELOOP);
  FileHandle handle;
  EXPECT_EQ(createNamed(folder + "dangling", handle), EEXIST);
}

} // namespace support
