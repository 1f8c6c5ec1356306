#include <gmock/gmock.h>

#include "platform/host/offscreen_host.h"
#include "tests/support/temporary_folder.h"

namespace {

/// The machine of every test that does not bring its own: no display, an empty profile.
class Machine : public testing::Environment {
 public:
  void SetUp() override { platform::SetHost(&m_host); }
  void TearDown() override { platform::SetHost(nullptr); }

 private:
  feltside::tests::TemporaryFolder m_folder;
  platform::OffscreenHost m_host{m_folder.Path()};
};

}  // namespace

int main(int argc, char** argv) {
  testing::InitGoogleMock(&argc, argv);
  testing::AddGlobalTestEnvironment(new Machine);
  return RUN_ALL_TESTS();
}
