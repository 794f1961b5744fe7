// Worlds by id: a name for a running world, "" for one the host does not
// have, and a fault for one world only.
#include <gtest/gtest.h>

#include "hostctl/HostFixture.h"
#include "hostctl/resource/WorldImpl.h"

namespace {

class Worlds : public FreshHost {
protected:
    void SetUp() override {
        MakeHost(R"({"format": "orvix-host-profile", "version": 1,
          "worlds": [{"id": 4294967295, "name": "orvm:edge", "kind": "vm"}, {"id": 7}]})");
    }
};

TEST_F(Worlds, NamesAreReadByIdAndAnUnknownWorldHasNone) {
    EXPECT_EQ(PldCtl::Resource::WorldImpl(4294967295u).GetWorldName(), "orvm:edge");
    EXPECT_EQ(PldCtl::Resource::WorldImpl(7).GetWorldName(), "");
    EXPECT_EQ(PldCtl::Resource::WorldImpl(8).GetWorldName(), "");
    // An id past 32 bits is no other world's.
    EXPECT_EQ(PldCtl::Resource::WorldImpl(4294967296u + 7).GetWorldName(), "");
}

TEST_F(Worlds, AFaultFailsTheNameOfItsWorldOnly) {
    HostSim({"fault", "add", "WorldImpl::GetWorldName", "--key", "7", "--message", "world down"});
    EXPECT_EQ(MessageOf([] { PldCtl::Resource::WorldImpl(7).GetWorldName(); }), "world down");
    EXPECT_EQ(PldCtl::Resource::WorldImpl(4294967295u).GetWorldName(), "orvm:edge");
}

}  // namespace
