#include "platform/regular_file.h"

#include <gtest/gtest.h>

#include "support/temp_dir.h"

namespace {

using namespace datetimelib::platform;

// The identity handed back is that of the file read: the zone cache compares it
// with the file's identity later to see whether the file was replaced. (Moving
// the opened file out of Open once lost it, so every zone file looked replaced.)
TEST(RegularFile, IdentitySurvivesOpeningAndMoving) {
  datetimelib::testing::TempDir folder;
  ASSERT_TRUE(folder.ok());
  const std::string path = folder.Write("zone", "bytes");
  const std::optional<FileIdentity> named = IdentityOf(path);
  ASSERT_TRUE(named.has_value());
  ASSERT_NE(named->inode, 0u);

  FileIdentity read;
  ASSERT_TRUE(ReadRegularFile(path, 64, &read).has_value());
  EXPECT_EQ(read, *named);

  auto opened = RegularFile::Open(path);
  ASSERT_TRUE(opened.has_value());
  RegularFile moved = std::move(*opened);
  EXPECT_EQ(moved.Identity(), *named);
  auto assigned = RegularFile::Open(path);
  ASSERT_TRUE(assigned.has_value());
  *assigned = std::move(moved);
  EXPECT_EQ(assigned->Identity(), *named);
  char buffer[8];
  EXPECT_EQ(assigned->Read(buffer, sizeof buffer), 5);  // the moved descriptor, open
}

}  // namespace
