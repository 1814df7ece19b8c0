// SPDX-License-Identifier: Apache-2.0
//
// A new file takes over what protected the old one, as far as the host lets this user. Order
// matters: a new owner takes rights away that only the mode, which comes last, gives back. Where
// the file comes to belong to somebody else, it must not run with the rights of its owner.
#include "support/src/posix_protection.h"

#include <string>
#include <string_view>
#include <sys/stat.h>
#include <unistd.h>

#ifdef __linux__
#include <sys/xattr.h>
#endif

namespace support {

namespace {

constexpr mode_t ModeBits = 07777;

// Who owns a file now, and who should.
struct Owners {
  bool isUserKept = false;
  bool isGroupKept = false;
};

Owners copyOwners(int descriptor, const FileStatus& status) {
  const auto uid = static_cast<uid_t>(status.uid);
  const auto gid = static_cast<gid_t>(status.gid);
  struct stat now;
  const auto compare = [&]() -> Owners {
    if (fstat(descriptor, &now) != 0) return {};
    return {.isUserKept = now.st_uid == uid, .isGroupKept = now.st_gid == gid};
  };
  const Owners before = compare();
  if (before.isUserKept && before.isGroupKept) return before;
  // A user may mostly give a file to another of his groups, but not to another user.
  if (fchown(descriptor, uid, gid) != 0 && fchown(descriptor, static_cast<uid_t>(-1), gid) != 0)
    return before;
  return compare();
}

// Another group may do no more than everybody.
mode_t withoutGroupRights(mode_t mode) {
  const mode_t ofAll = (mode & S_IRWXO) << 3;
  return (mode & ~static_cast<mode_t>(S_IRWXG)) | (mode & ofAll);
}

#ifdef __linux__

// The kernel's own limit, of a value and of all names together.
constexpr size_t LargestAttribute = 0x10000;

// What speaks of the file's bytes (signatures, capabilities of a program) is not true of the new
// ones.
bool isCopied(std::string_view attribute) {
  return attribute.starts_with("user.") || attribute == "security.selinux";
}

constexpr const char* AccessList = "system.posix_acl_access";

bool copyAttribute(int descriptor, const char* from, const char* attribute) {
  std::string value(LargestAttribute, '\0');
  const ssize_t size = getxattr(from, attribute, value.data(), value.size());
  if (size < 0) return false;
  return fsetxattr(descriptor, attribute, value.data(), static_cast<size_t>(size), 0) == 0;
}

// A new file may have a list that its folder gives, with more in it than the old one's group.
bool copyAccessList(int descriptor, const char* from) {
  if (getxattr(from, AccessList, nullptr, 0) > 0)
    return copyAttribute(descriptor, from, AccessList);
  // Hosts that know no lists refuse the removal with errors of many kinds.
  return fgetxattr(descriptor, AccessList, nullptr, 0) <= 0 ||
         fremovexattr(descriptor, AccessList) == 0;
}

// The names come one behind the other, each with a NUL.
void copyAttributes(int descriptor, const char* from) {
  if (listxattr(from, nullptr, 0) <= 0) return;
  std::string names(LargestAttribute, '\0');
  const ssize_t size = listxattr(from, names.data(), names.size());
  names.resize(size > 0 ? static_cast<size_t>(size) : 0);
  for (size_t start = 0; start < names.size(); start = names.find('\0', start) + 1) {
    const char* attribute = names.data() + start;
    if (isCopied(attribute)) copyAttribute(descriptor, from, attribute);
  }
}

#else

bool copyAccessList(int, const char*) {
  return true;
}

void copyAttributes(int, const char*) {}

#endif

} // namespace

void copyProtectionTo(int descriptor, const char* from, const FileStatus& status) {
  mode_t mode = status.mode & ModeBits;
  const Owners owners = copyOwners(descriptor, status);
  if (!owners.isUserKept || !owners.isGroupKept) mode &= ~static_cast<mode_t>(S_ISUID | S_ISGID);
  const bool isListKept = copyAccessList(descriptor, from);
  if (!owners.isGroupKept || !isListKept) mode = withoutGroupRights(mode);
  copyAttributes(descriptor, from);
  [[maybe_unused]] const int result = fchmod(descriptor, mode);
}

} // namespace support
