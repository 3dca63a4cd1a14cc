// SPDX-License-Identifier: Apache-2.0
// Settings, profiles and the network environment from end to end, with the stand-in service.
#include "tests/imsctl/with_stand_in.hpp"
#include "tests/support/files.hpp"

#include <filesystem>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>

namespace test {
namespace {

using testing::HasSubstr;

class Settings : public WithStandIn {
  protected:
    static Json get(const std::string &set) {
        return run_imsctl({"settings", "get", set, "--json"}).json()["settings"];
    }

    TemporaryDirectory directory_;
};

TEST_F(Settings, AreShownWithTheirTypes) {
    const Json all = get("default");
    EXPECT_EQ(all.size(), 334u);
    EXPECT_EQ(all["name"], "default");
    EXPECT_TRUE(all["ringing_timer"].is_number_integer());
    EXPECT_TRUE(all["is_rcs_enabled"].is_boolean());
    EXPECT_TRUE(all["min_se"].is_string());
    EXPECT_TRUE(all["poc_ringing_timer"].is_number_integer());
    EXPECT_EQ(run_imsctl(split("settings get default name")).output, "name=\"default\"\n");
}

TEST_F(Settings, ChangeWhereTheyAreSetAndNowhereElse) {
    Json expected = get("default");
    expected["ringing_timer"] = 4711;
    expected["is_rcs_enabled"] = !expected["is_rcs_enabled"].get<bool>();
    expected["min_se"] = "a b";
    expected["poc_ringing_timer"] = 77;
    const std::string flag = expected["is_rcs_enabled"].dump();
    const Outcome outcome =
        run_imsctl({"settings", "set", "default", "ringing_timer=4711", "is_rcs_enabled=" + flag,
                    "min_se=a b", "poc_ringing_timer=77"});
    EXPECT_EQ(outcome.status, 0) << outcome.error;
    EXPECT_EQ(outcome.error, "");
    EXPECT_THAT(outcome.output, testing::ContainsRegex("ringing_timer: [0-9]+ -> 4711\n"));
    EXPECT_THAT(outcome.output, HasSubstr(" -> \"a b\"\n"));
    EXPECT_EQ(get("default").dump(), expected.dump());
    EXPECT_EQ(run_imsctl(split("settings set default ringing_timer=4711")).output,
              "nothing to change\n");
    EXPECT_EQ(run_imsctl(split("settings set default ringing_timer=1 --json")).json().dump(),
              R"({"verb":"settings set","name":"default",)"
              R"("changed":{"ringing_timer":{"from":4711,"to":1}}})");
}

TEST_F(Settings, KeepPasswordsOutOfSight) {
    EXPECT_EQ(run_imsctl(split("settings set default http_password=secret")).status, 0);
    EXPECT_EQ(run_imsctl(split("settings get default http_password")).output,
              "http_password=********\n");
    EXPECT_EQ(run_imsctl(split("settings get default http_password --show-secrets")).output,
              "http_password=\"secret\"\n");
    EXPECT_EQ(get("default")["http_password"], "secret");
}

TEST_F(Settings, CanBeCopiedComparedAndDeleted) {
    const Outcome added =
        run_imsctl(split("settings add roaming --from default ringing_timer=99 network=abroad"));
    EXPECT_EQ(added.status, 0) << added.error;
    EXPECT_EQ(added.output, "name=\"roaming\"\n");
    const Json diff = run_imsctl(split("settings diff default roaming --json")).json();
    EXPECT_EQ(diff["different"].size(), 3u) << diff;
    EXPECT_EQ(diff["different"]["ringing_timer"]["second"], 99);
    EXPECT_THAT(run_imsctl(split("settings diff default roaming")).output,
                HasSubstr("name: \"default\" | \"roaming\"\n"));
    EXPECT_EQ(run_imsctl(split("settings diff roaming roaming")).output, "no difference\n");
    EXPECT_EQ(run_imsctl(split("settings add roaming --json")).json()["error"]["kind"], "service");
    EXPECT_EQ(run_imsctl(split("settings delete roaming")).output, "name=\"roaming\"\n");
    const Outcome gone = run_imsctl(split("settings get roaming"));
    EXPECT_EQ(gone.status, 1);
    EXPECT_THAT(gone.error, HasSubstr("is there a settings set called \"roaming\"?"));
    EXPECT_EQ(run_imsctl(split("settings delete roaming")).status, 1);
}

TEST_F(Settings, MakeANewSetFromNothing) {
    const Outcome added = run_imsctl(split("settings add plain id=3"));
    EXPECT_EQ(added.status, 0) << added.error;
    EXPECT_EQ(added.error, "");
    const Json all = get("plain");
    EXPECT_EQ(all["id"], 3);
    EXPECT_EQ(all["network"], "");
}

TEST_F(Settings, SurviveExportAndImport) {
    const std::string file = directory_.file("default.json");
    EXPECT_EQ(run_imsctl({"settings", "export", "default", file}).status, 0);
    struct stat status {};
    ASSERT_EQ(stat(file.c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 0777, 0600u);
    const Json before = get("default");
    EXPECT_EQ(Json::parse(content_of(file)).dump(), before.dump());
    EXPECT_EQ(run_imsctl(split("settings export default -")).output, content_of(file));
    EXPECT_EQ(run_imsctl({"settings", "import", file}).output, "\"default\" unchanged\n");

    EXPECT_EQ(run_imsctl(split("settings set default ringing_timer=4711 bsf_port=x")).status, 0);
    const Json changed = run_imsctl({"settings", "import", file, "--json"}).json();
    EXPECT_EQ(changed["action"], "changed");
    EXPECT_EQ(changed["changed"].size(), 2u);
    EXPECT_EQ(get("default").dump(), before.dump());

    EXPECT_EQ(run_imsctl(split("settings delete default")).status, 0);
    EXPECT_EQ(run_imsctl({"settings", "import", file}).output, "\"default\" added\n");
    EXPECT_EQ(get("default").dump(), before.dump());
}

TEST_F(Settings, AreChangedByAFileThatHasAPartOfThem) {
    const std::string file = directory_.file("part.json");
    put_content(file, R"({"name": "default", "ringing_timer": 5, "audio_port_end": 1})");
    const Outcome outcome = run_imsctl({"settings", "import", file, "--json"});
    EXPECT_EQ(outcome.status, 0);
    EXPECT_EQ(outcome.json()["not_written"], Json({"audio_port_end"}));
    EXPECT_THAT(outcome.error, HasSubstr("not written, because the service takes no value: "
                                         "audio_port_end\n"));
    EXPECT_EQ(get("default")["ringing_timer"], 5);
}

TEST_F(Settings, ComeFromNoFileThatIsWrong) {
    const Json before = get("default");
    const std::string file = directory_.file("wrong.json");
    put_content(file, "{\n\"name\": \"default\",\n\"ringing_timer\": 5,\n\"ringing_timr\": 5\n}");
    const Outcome wrong = run_imsctl({"settings", "import", file, "--json"});
    EXPECT_EQ(wrong.status, 1);
    EXPECT_EQ(wrong.json()["error"]["kind"], "input");
    EXPECT_EQ(wrong.json()["error"]["lines"], Json({4}));
    put_content(file, R"({"name": "defualt", "ringing_timer": 5})");
    EXPECT_THAT(run_imsctl({"settings", "import", file}).error,
                HasSubstr("the set \"defualt\" cannot be read, and for a new one the file has no "
                          "value for id, network, "));
    EXPECT_THAT(run_imsctl({"settings", "import", file}).error,
                testing::ContainsRegex(" network(, [a-z_0-9]+){3} and 325 more\n"));
    put_content(file, R"({"ringing_timer": 5})");
    EXPECT_THAT(run_imsctl({"settings", "import", file}).error, HasSubstr("there is no \"name\""));
    EXPECT_EQ(get("default").dump(), before.dump());
}

TEST_F(Settings, AreNotWrittenToAPlaceThatTakesNone) {
    const Outcome outcome = run_imsctl(split("settings export default /nonexistent/a --json"));
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(outcome.json()["error"]["kind"], "output");
    EXPECT_EQ(run_imsctl(split("settings export default /dev/full")).status, 1);
}

TEST_F(Settings, IncludeProfiles) {
    const Json before = run_imsctl(split("profile list --json")).json()["profiles"];
    ASSERT_EQ(before.size(), 2u);
    EXPECT_EQ(before[0].size(), 51u);
    const std::string id = before[0]["id"].dump();
    EXPECT_EQ(run_imsctl({"profile", "show", id, "id"}).output, "id=" + id + "\n");

    EXPECT_EQ(run_imsctl({"profile", "set", id, "port=5099", "--json"}).json()["changed"]["port"],
              Json({{"from", before[0]["port"]}, {"to", 5099}}));
    EXPECT_EQ(run_imsctl({"profile", "show", id, "port"}).output, "port=5099\n");

    const Outcome added = run_imsctl({"profile", "add", "backup", "--from", id, "password=p"});
    EXPECT_EQ(added.status, 0) << added.error;
    const Json backup = run_imsctl(split("profile show backup --json")).json()["profile"];
    EXPECT_EQ(backup["port"], 5099);
    EXPECT_EQ(backup["password"], "p");
    EXPECT_NE(backup["id"], before[0]["id"]);
    EXPECT_THAT(run_imsctl(split("profile show backup")).output,
                HasSubstr("\npassword=********\n"));
    EXPECT_THAT(run_imsctl(split("profile list")).output, HasSubstr("name=\"backup\""));

    EXPECT_EQ(run_imsctl(split("profile delete backup")).status, 0);
    const Outcome gone = run_imsctl(split("profile show backup --json"));
    EXPECT_EQ(gone.status, 1);
    EXPECT_EQ(gone.json()["error"]["kind"], "profile");
    EXPECT_EQ(run_imsctl(split("profile delete 4711 --json")).json()["error"]["kind"], "service");
}

TEST_F(Settings, IncludeTheNetworkEnvironment) {
    EXPECT_EQ(run_imsctl(split("network-environment set 2")).output, "ok\n");
    EXPECT_EQ(run_imsctl(split("network-environment get")).output, "environment_type=2\n");
    EXPECT_EQ(run_imsctl(split("network-environment get --json")).json()["environment_type"], 2);
}

} // namespace
} // namespace test
