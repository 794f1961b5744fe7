// IPsec as IpSecConfigImpl keeps it: the converters and their defaults, SAs
// and SPs with their refusals, policies whose SA went away, automatic SAs,
// keys that never leave the store, and the careful reading of IKE files.
#include <sys/stat.h>

#include <fstream>

#include "hostctl/ip/IpHost.h"
#include "hostctl/network/ip/IpSecConfigImpl.h"
#include "support/test_util.h"

namespace {

using HostCtl::Network::IpSecSadParam;
using HostCtl::Network::IpSecSpdParam;
using HostCtl::Network::Ipv6Address;
using PldCtl::Network::IpSecConfigImpl;

class Ipsec : public IpHost {
protected:
    IpSecConfigImpl ipsec_;
    OrvixTest::TempDir files_;

    static IpSecSadParam Sa(const std::string& name, std::uint32_t spi) {
        IpSecSadParam sa;
        sa.name = name;
        sa.source = Ipv6Address("2001:db8:10::21");
        sa.destination = Ipv6Address("2001:db8:10::44");
        sa.spi = spi;
        sa.mode = IpSecConfigImpl::StringToIpSecMode("tunnel");
        sa.encryptionAlgorithm = IpSecConfigImpl::StringToIpSecEncyptAlgo("aes128-cbc");
        sa.encryptionKey = "sixteen-byte-key";
        sa.integrityAlgorithm = IpSecConfigImpl::StringToIpSecAuthAlgo("hmac-sha2-256");
        sa.integrityKey = "0x" + std::string(64, 'a');
        sa.lifetime = 600;
        return sa;
    }
    static IpSecSpdParam Sp(const std::string& name, const std::string& saName) {
        IpSecSpdParam sp;
        sp.name = name;
        sp.saName = saName;
        sp.sourceAddress = Ipv6Address("2001:db8:10::21");
        sp.sourcePrefixLength = 128;
        sp.destinationAddress = Ipv6Address("2001:db8:44::7");
        sp.destinationPrefixLength = 64;
        sp.destinationPort = 8443;
        sp.upperLayerProtocol = IpSecConfigImpl::StringToIpSecULProtoType("tcp");
        return sp;
    }
    std::vector<IpSecSadParam> Sas() {
        std::vector<IpSecSadParam> sas;
        ipsec_.GetSADConfigList(sas);
        return sas;
    }
    std::vector<IpSecSpdParam> Sps() {
        std::vector<IpSecSpdParam> sps;
        ipsec_.GetSPDConfigList(sps);
        return sps;
    }
    std::string SaNameOf(const std::string& sp) {
        for (const auto& p : Sps()) {
            if (p.name == sp) return p.saName;
        }
        return "(no SP)";
    }
    Json IpsecState() const {
        const Json dump = Dump();
        return Json{dump["ipsecSAs"], dump["ipsecSPs"], dump["ipsec"]};
    }
    std::string File(const std::string& name, const std::string& content) {
        const std::string path = files_.Path() + "/" + name;
        OrvixTest::WriteFile(path, content);
        return path;
    }
};

TEST_F(Ipsec, ConvertersNameEveryWordOfTheirTableAndDefaultTheEmptyWord) {
    using Converter = int (*)(const std::string&);
    const struct {
        Converter convert;
        const std::vector<std::string>& table;
        std::string empty;
        std::string what;
    } converters[] = {
        {&IpSecConfigImpl::StringToIpSecMode, IpSecConfigImpl::SA_MODE, "any", "IPsec mode"},
        {&IpSecConfigImpl::StringToIpSecEncyptAlgo, IpSecConfigImpl::SA_ENCPT_ALG, "null", "encryption algorithm"},
        {&IpSecConfigImpl::StringToIpSecAuthAlgo, IpSecConfigImpl::SA_AUTH_ALG, "hmac-sha1", "integrity algorithm"},
        {&IpSecConfigImpl::StringToIpSecULProtoType, IpSecConfigImpl::SP_UL_PROTO_TYPE, "any", "upper layer protocol"},
        {&IpSecConfigImpl::StringToIpSecDirection, IpSecConfigImpl::SP_DIRECTION, "out", "flow direction"},
        {&IpSecConfigImpl::StringToIpSecAction, IpSecConfigImpl::SP_ACTION, "ipsec", "action"},
    };
    for (const auto& c : converters) {
        ASSERT_FALSE(c.table.empty());
        for (std::size_t i = 0; i < c.table.size(); ++i) EXPECT_EQ(c.convert(c.table[i]), static_cast<int>(i));
        EXPECT_EQ(c.table.at(static_cast<std::size_t>(c.convert(""))), c.empty);
        EXPECT_EQ(MessageOf([&] { c.convert("Tunnel"); }), "Invalid " + c.what + " 'Tunnel'");
    }
    EXPECT_EQ(IpSecConfigImpl::SA_STATE.size(), 4u);
}

TEST_F(Ipsec, SecurityAssociationsAreListedWithoutTheirKeys) {
    ipsec_.AddSADConfig(Sa("sa-new", 0x1f4));
    const auto sas = Sas();
    ASSERT_FALSE(sas.empty());
    const IpSecSadParam& added = sas.back();
    EXPECT_EQ(added.name, "sa-new");
    EXPECT_EQ(added.spi, 500u);
    EXPECT_EQ(IpSecConfigImpl::SA_MODE.at(static_cast<std::size_t>(added.mode)), "tunnel");
    EXPECT_EQ(IpSecConfigImpl::SA_STATE.at(static_cast<std::size_t>(added.state)), "mature");
    EXPECT_EQ(added.lifetime, 600u);
    for (const auto& sa : sas) {
        EXPECT_EQ(sa.encryptionKey, "") << sa.name;
        EXPECT_EQ(sa.integrityKey, "") << sa.name;
    }
    // The keys are kept in the store, which only its owner may read.
    EXPECT_EQ(Stored("ipsecSAs", "name", "sa-new").value("encryptionKey", ""), "sixteen-byte-key");
    struct stat st {};
    ASSERT_EQ(stat(DbPath().c_str(), &st), 0);
    EXPECT_EQ(st.st_mode & 077, 0u);
}

TEST_F(Ipsec, RefusedSecurityAssociationsWriteNothing) {
    ipsec_.AddSADConfig(Sa("sa-new", 77));
    const Json before = IpsecState();
    auto add = [&](const IpSecSadParam& sa) { return MessageOf([&] { ipsec_.AddSADConfig(sa); }); };
    EXPECT_EQ(add(Sa("sa-new", 78)), "SA sa-new already exists");
    EXPECT_EQ(add(Sa("sa-other", 77)), "SA SPI 0x4d between 2001:db8:10::21 and 2001:db8:10::44 is in use");
    EXPECT_EQ(add(Sa("two words", 79)), "Invalid SA name 'two words': use a name without blanks or control characters");
    EXPECT_EQ(add(Sa("", 79)), "Invalid SA name '': use a name without blanks or control characters");
    IpSecSadParam shortKey = Sa("sa-short", 80);
    shortKey.encryptionKey = "0x0011";
    EXPECT_EQ(add(shortKey), "Invalid encryption key for aes128-cbc: use 16 characters or 0x and 32 hex digits");
    IpSecSadParam notHex = Sa("sa-nothex", 80);
    notHex.integrityKey = "0x" + std::string(63, 'a') + "g";
    EXPECT_EQ(add(notHex), "Invalid integrity key for hmac-sha2-256: use 32 characters or 0x and 64 hex digits");
    IpSecSadParam nullWithKey = Sa("sa-null", 80);
    nullWithKey.encryptionAlgorithm = IpSecConfigImpl::StringToIpSecEncyptAlgo("null");
    EXPECT_EQ(add(nullWithKey), "Encryption algorithm null takes no key");
    IpSecSadParam badMode = Sa("sa-mode", 80);
    badMode.mode = 7;
    EXPECT_EQ(add(badMode), "Invalid IPsec mode '7'");
    EXPECT_EQ(IpsecState(), before);
    nullWithKey.encryptionKey.clear();
    ipsec_.AddSADConfig(nullWithKey);
}

TEST_F(Ipsec, RemovingAnSaMarksThePoliciesThatNameIt) {
    ipsec_.AddSADConfig(Sa("sa-a", 1));
    ipsec_.AddSADConfig(Sa("sa-b", 2));
    ipsec_.AddSPDConfig(Sp("sp-a", "sa-a"));
    ipsec_.AddSPDConfig(Sp("sp-b", "sa-b"));
    ipsec_.AddSPDConfig(Sp("sp-any", ""));
    ipsec_.RemoveSADConfig("sa-a");
    EXPECT_EQ(SaNameOf("sp-a"), "UNKNOWN");
    EXPECT_EQ(SaNameOf("sp-b"), "sa-b");
    EXPECT_EQ(SaNameOf("sp-any"), "");
    EXPECT_EQ(MessageOf([&] { ipsec_.RemoveSADConfig("sa-a"); }), "SA sa-a does not exist");

    ipsec_.FlushSADConfig();
    EXPECT_TRUE(Sas().empty());
    EXPECT_EQ(SaNameOf("sp-b"), "UNKNOWN");
    EXPECT_EQ(SaNameOf("sp-any"), "");
    // A policy cannot name an SA the host does not have, UNKNOWN included.
    EXPECT_EQ(MessageOf([&] { ipsec_.AddSPDConfig(Sp("sp-c", "UNKNOWN")); }), "SA UNKNOWN for SP sp-c does not exist");
}

TEST_F(Ipsec, AutomaticSasAreRemovedBySourceDestinationAndSpiOnly) {
    MakeHost(R"({"format": "orvix-host-profile", "version": 1, "netstacks": [{"key": "defaultTcpipStack"}],
      "ipsecSAs": [
        {"name": "auto-1", "auto": true, "source": "2001:db8::1", "destination": "2001:db8::2", "spi": 4096},
        {"name": "manual", "source": "2001:db8::1", "destination": "2001:db8::2", "spi": 4097}],
      "ipsecSPs": [{"name": "sp", "saName": "auto-1"}]})");
    IpSecSadParam sa;
    sa.source = Ipv6Address("2001:db8::1");
    sa.destination = Ipv6Address("2001:db8::2");
    sa.spi = 4097;
    EXPECT_EQ(MessageOf([&] { ipsec_.RemoveAutoSADConfig(sa); }),
              "No automatic SA from 2001:db8::1 to 2001:db8::2 with SPI 0x1001");
    sa.spi = 4096;
    sa.destination = Ipv6Address("2001:db8::3");
    EXPECT_EQ(MessageOf([&] { ipsec_.RemoveAutoSADConfig(sa); }),
              "No automatic SA from 2001:db8::1 to 2001:db8::3 with SPI 0x1000");
    EXPECT_EQ(Sas().size(), 2u);
    sa.destination = Ipv6Address("2001:db8::2");
    ipsec_.RemoveAutoSADConfig(sa);
    ASSERT_EQ(Sas().size(), 1u);
    EXPECT_EQ(Sas()[0].name, "manual");
    EXPECT_EQ(SaNameOf("sp"), "UNKNOWN");
    // Stored defaults read as the table's words.
    const auto sp = Sps().at(0);
    EXPECT_EQ(IpSecConfigImpl::SP_DIRECTION.at(static_cast<std::size_t>(sp.direction)), "out");
    EXPECT_EQ(IpSecConfigImpl::SP_ACTION.at(static_cast<std::size_t>(sp.action)), "ipsec");
    EXPECT_EQ(sp.sourcePrefixLength, 0);
}

TEST_F(Ipsec, SecurityPoliciesAddRemoveAndFlush) {
    IpSecSpdParam sp = Sp("sp-new", "");
    ipsec_.AddSPDConfig(sp);
    const IpSecSpdParam added = Sps().back();
    EXPECT_EQ(added.name, "sp-new");
    // The destination's host bits are cleared.
    EXPECT_EQ(added.destinationAddress.GetStringAddress(), "2001:db8:44::");
    EXPECT_EQ(added.destinationPrefixLength, 64);
    EXPECT_EQ(added.destinationPort, 8443);
    EXPECT_EQ(IpSecConfigImpl::SP_UL_PROTO_TYPE.at(static_cast<std::size_t>(added.upperLayerProtocol)), "tcp");

    const Json before = IpsecState();
    EXPECT_EQ(MessageOf([&] { ipsec_.AddSPDConfig(sp); }), "SP sp-new already exists");
    sp.name = "sp-port";
    sp.sourcePort = 65536;
    EXPECT_EQ(MessageOf([&] { ipsec_.AddSPDConfig(sp); }), "Invalid source port 65536: must be between 0 and 65535");
    sp.sourcePort = 0;
    sp.destinationPort = -1;
    EXPECT_EQ(MessageOf([&] { ipsec_.AddSPDConfig(sp); }), "Invalid destination port -1: must be between 0 and 65535");
    sp.destinationPort = 0;
    sp.saName = "nope";
    EXPECT_EQ(MessageOf([&] { ipsec_.AddSPDConfig(sp); }), "SA nope for SP sp-port does not exist");
    EXPECT_EQ(MessageOf([&] { ipsec_.RemoveSPDConfig("nope"); }), "SP nope does not exist");
    EXPECT_EQ(IpsecState(), before);

    ipsec_.RemoveSPDConfig("sp-new");
    for (const auto& p : Sps()) EXPECT_NE(p.name, "sp-new");
    ipsec_.FlushSPDConfig();
    EXPECT_TRUE(Sps().empty());
    EXPECT_FALSE(Sas().empty());
}

TEST_F(Ipsec, IkeConfigurationFilesAreReadCarefully) {
    const std::string good = File("iked.conf", "listen 2001:db8:10::21\n\tpeer 2001:db8:10::90\r\n");
    ipsec_.CheckIKEConfig(good);
    ipsec_.CopyIKEConfig(good);
    const Json stored = Dump()["ipsec"];
    EXPECT_EQ(stored["ikeConfig"], "listen 2001:db8:10::21\n\tpeer 2001:db8:10::90\r\n");
    EXPECT_EQ(stored["ikeConfigSource"], good);

    const Json before = IpsecState();
    const std::string missing = files_.Path() + "/missing.conf";
    EXPECT_EQ(MessageOf([&] { ipsec_.CheckIKEConfig(missing); }),
              "IKE configuration " + missing + " cannot be read: No such file or directory");
    EXPECT_EQ(MessageOf([&] { ipsec_.CopyIKEConfig(files_.Path()); }),
              "IKE configuration " + files_.Path() + " is not a regular file");
    // Opening a FIFO with no writer must not wait for one.
    const std::string fifo = files_.Path() + "/fifo";
    ASSERT_EQ(mkfifo(fifo.c_str(), 0600), 0);
    EXPECT_EQ(MessageOf([&] { ipsec_.CopyIKEConfig(fifo); }), "IKE configuration " + fifo + " is not a regular file");
    const std::string large = File("large.conf", std::string(65537, '#'));
    EXPECT_EQ(MessageOf([&] { ipsec_.CopyIKEConfig(large); }),
              "IKE configuration " + large + " has 65537 bytes, more than the 65536 allowed");
    const std::string binary = File("binary.conf", std::string("listen\0", 7));
    EXPECT_EQ(MessageOf([&] { ipsec_.CheckIKEConfig(binary); }),
              "IKE configuration " + binary + " cannot be read: it is not a text file");
    EXPECT_EQ(IpsecState(), before);
    ipsec_.CheckIKEConfig(File("limit.conf", std::string(65536, '#')));
}

TEST_F(Ipsec, RestartingTheDaemonsIsRecordedAndAFailedRunIsReported) {
    ipsec_.RestartIKEDaemons();
    Json log = Dump()["execLog"];
    ASSERT_FALSE(log.empty());
    EXPECT_EQ(log.back()["command"], "/etc/init.d/iked restart");
    EXPECT_EQ(log.back().value("exitStatus", -1), 0);

    ArmFault("Util::PldCtl_Exec", "/etc/init.d/iked restart", "exit 1");
    EXPECT_EQ(MessageOf([&] { ipsec_.RestartIKEDaemons(); }), "Unable to restart the IKE daemons");
    const Json dump = Dump();
    EXPECT_EQ(dump["execLog"].back().value("exitStatus", 0), 1);
    EXPECT_EQ(dump["ipsec"].value("ikeDaemonsRunning", true), false);
}

TEST_F(Ipsec, InjectedFaultsFailTheirOperationForTheirName) {
    ArmFault("IpSecConfigImpl::AddSADConfig", "sa-x", "SAD full");
    ArmFault("IpSecConfigImpl::GetSPDConfigList", "", "SPD unreadable");
    EXPECT_EQ(MessageOf([&] { ipsec_.AddSADConfig(Sa("sa-x", 9)); }), "SAD full");
    ipsec_.AddSADConfig(Sa("sa-y", 9));
    EXPECT_EQ(MessageOf([&] { Sps(); }), "SPD unreadable");
}

}  // namespace
