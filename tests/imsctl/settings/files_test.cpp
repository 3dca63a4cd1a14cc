// SPDX-License-Identifier: Apache-2.0
// Settings and profiles as far as no service is needed: keys, values and files.
#include "imsctl/output/failure.hpp"
#include "imsctl/settings/file.hpp"
#include "imsctl/settings/record.hpp"
#include "tests/imsctl/in_process.hpp"

#include <algorithm>
#include <cstdlib>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

using testing::AnyOf;
using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::Not;

template <class Record>
std::ptrdiff_t count_of(KeyType type) {
    const auto keys = keys_of<Record>();
    return std::count_if(keys.begin(), keys.end(),
                         [&](const Key<Record> &key) { return type_of(key) == type; });
}

TEST(SettingsKeys, AreThoseOfTheRecords) {
    EXPECT_EQ(count_of<SettingsRecord>(KeyType::kNumber), 163);
    EXPECT_EQ(count_of<SettingsRecord>(KeyType::kFlag), 13);
    EXPECT_EQ(count_of<SettingsRecord>(KeyType::kText), 158);
    EXPECT_EQ(count_of<ProfileRecord>(KeyType::kNumber), 27);
    EXPECT_EQ(count_of<ProfileRecord>(KeyType::kFlag), 4);
    EXPECT_EQ(count_of<ProfileRecord>(KeyType::kText), 20);
}

// Another value for each place, as far as the type allows.
Value value_for(KeyType type, std::size_t place) {
    switch (type) {
    case KeyType::kNumber:
        return static_cast<std::int64_t>(place) - 100;
    case KeyType::kFlag:
        return place % 2 == 0;
    case KeyType::kText:
        break;
    }
    return "text \"" + std::to_string(place) + "\"\n\u00e4";
}

template <class Record>
RecordPtr<Record> filled_record() {
    auto record = new_record<Record>();
    for (std::size_t place = 0; const auto &key : keys_of<Record>())
        store(*record, key, value_for(type_of(key), ++place));
    return record;
}

template <class Record>
void expect_every_key_of_its_own() {
    const auto record = filled_record<Record>();
    for (std::size_t place = 0; const auto &key : keys_of<Record>()) {
        EXPECT_EQ(to_text(value_of(*record, key)), to_text(value_for(type_of(key), ++place)))
            << key.name;
        EXPECT_EQ(find_key<Record>(key.name), &key);
    }
}

TEST(SettingsRecords, KeepEachValueByItself) {
    expect_every_key_of_its_own<SettingsRecord>();
    expect_every_key_of_its_own<ProfileRecord>();
}

TEST(SettingsRecords, HaveTheKeysUnderTheNamesOfTheMembers) {
    const auto settings = filled_record<SettingsRecord>();
    settings->ringing_timer = 4711;
    settings->poc_invite_timeout.value = 12;
    EXPECT_EQ(value_of(*settings, *find_key<SettingsRecord>("ringing_timer")),
              Value(std::int64_t{4711}));
    EXPECT_EQ(value_of(*settings, *find_key<SettingsRecord>("poc_invite_timeout")),
              Value(std::int64_t{12}));
    EXPECT_EQ(find_key<SettingsRecord>("rtp_timeout_b2bptt"), nullptr);
    EXPECT_EQ(find_key<SettingsRecord>(""), nullptr);
}

TEST(SettingsRecords, TellATimerThatIsNoNumberFromOneThatDidNotCome) {
    const auto settings = new_record<SettingsRecord>();
    const auto *timer = find_key<SettingsRecord>("poc_ringing_timer");
    EXPECT_EQ(value_of(*settings, *timer), Value());
    settings->poc_ringing_timer.text = strdup("soon");
    EXPECT_EQ(value_of(*settings, *timer), Value("soon"));
}

TEST(SettingsRecords, AreCompletedWhereTheServiceLeftSomethingOut) {
    const auto settings = filled_record<SettingsRecord>();
    EXPECT_TRUE(fill_gaps(*settings).empty());
    std::free(settings->network);
    settings->network = nullptr;
    std::free(settings->poc_ringing_timer.text);
    settings->poc_ringing_timer.text = strdup("soon");
    EXPECT_THAT(fill_gaps(*settings), ElementsAre("network", "poc_ringing_timer"));
    EXPECT_STREQ(settings->network, "");
    EXPECT_EQ(settings->poc_ringing_timer.value, 0);
}

TEST(SettingsRecords, TellWhatIsDifferent) {
    const auto first = filled_record<SettingsRecord>();
    const auto second = filled_record<SettingsRecord>();
    EXPECT_TRUE(differences(*first, *second).empty());
    second->ringing_timer = 7;
    store(*second, *find_key<SettingsRecord>("min_se"), std::string("90"));
    const Changes changes = differences(*first, *second);
    ASSERT_EQ(changes.size(), 2u);
    EXPECT_EQ(changes[0].key, "ringing_timer");
    EXPECT_EQ(changes[0].to, Value(std::int64_t{7}));
    EXPECT_EQ(changes[1].key, "min_se");
}

TEST(SettingsValues, AreOfTheKeysType) {
    EXPECT_EQ(value_from_text(KeyType::kNumber, "-5"), Value(std::int64_t{-5}));
    EXPECT_EQ(value_from_text(KeyType::kFlag, "true"), Value(true));
    EXPECT_EQ(value_from_text(KeyType::kText, "a=b"), Value("a=b"));
    for (const char *text : {"", "2147483648", "1.5", "x"})
        EXPECT_THROW(value_from_text(KeyType::kNumber, text), WrongValue) << text;
    for (const char *text : {"", "1", "True", "yes"})
        EXPECT_THROW(value_from_text(KeyType::kFlag, text), WrongValue) << text;
    try {
        value_from_text(KeyType::kText, "S3cret\xff");
        FAIL() << "taken";
    } catch (const WrongValue &wrong) {
        EXPECT_STREQ(wrong.what(), "this is not valid UTF-8"); // it may be a password
    }
}

TEST(SettingsValues, InJsonAreOfTheKeysTypeToo) {
    EXPECT_EQ(value_from_json(KeyType::kNumber, -2147483648), Value(std::int64_t{INT32_MIN}));
    EXPECT_EQ(value_from_json(KeyType::kNumber, 2147483647u), Value(std::int64_t{INT32_MAX}));
    const struct {
        KeyType type;
        const char *json;
    } wrong[] = {{KeyType::kNumber, "2147483648"},  {KeyType::kNumber, "-2147483649"},
                 {KeyType::kNumber, "1.0"},         {KeyType::kNumber, "18446744073709551615"},
                 {KeyType::kNumber, "\"1\""},       {KeyType::kNumber, "true"},
                 {KeyType::kNumber, "[]"},          {KeyType::kFlag, "1"},
                 {KeyType::kFlag, "\"true\""},      {KeyType::kText, "1"},
                 {KeyType::kText, "\"a\\u0000b\""}, {KeyType::kText, "{}"}};
    for (const auto &row : wrong)
        EXPECT_THROW(value_from_json(row.type, Json::parse(row.json)), WrongValue) << row.json;
}

TEST(SettingsValues, AreHiddenWhenTheyAreSecrets) {
    const Fields fields = {
        {"http_password_mcptt", "secret"}, {"password", ""}, {"authname", "alice"}};
    EXPECT_EQ(Shown(false).fields(fields),
              "http_password_mcptt=********\npassword=\"\"\nauthname=\"alice\"");
    EXPECT_THAT(Shown(true).fields(fields), HasSubstr("http_password_mcptt=\"secret\"\n"));
    const Changes changes = {{"password", "old", "new"}};
    EXPECT_EQ(Shown(false).changes(changes, "->"), "password: ******** -> ********");
    EXPECT_EQ(Shown(true).changes(changes, "->"), "password: \"old\" -> \"new\"");
}

TEST(SettingsFile, HasOneKeyALineInTheOrderOfTheRecord) {
    const auto settings = filled_record<SettingsRecord>();
    const std::string document = settings_document(*settings);
    EXPECT_EQ(std::count(document.begin(), document.end(), '\n'), 335);
    std::vector<std::string> names;
    const Json parsed = Json::parse(document);
    for (const auto &[name, value] : parsed.items())
        names.push_back(name);
    EXPECT_EQ(names, key_names<SettingsRecord>());
}

TEST(SettingsFile, GivesBackEveryValue) {
    const auto settings = filled_record<SettingsRecord>();
    const auto read = new_record<SettingsRecord>();
    const auto assignments = parse_settings(settings_document(*settings), "file");
    EXPECT_EQ(assignments.size(), 334u);
    assign_all(*read, assignments);
    EXPECT_TRUE(differences(*settings, *read).empty());
}

TEST(SettingsFile, LeavesOutWhatHasNoValue) {
    const auto assignments = parse_settings(R"({"name": "a", "network": null})", "file");
    ASSERT_EQ(assignments.size(), 1u);
    EXPECT_EQ(assignments.front().key->name, "name");
}

struct FileRow {
    const char *document;
    const char *message;
};

void PrintTo(const FileRow &row, std::ostream *out) {
    *out << row.document;
}

const FileRow kWrongFiles[] = {
    {"", "f: line 1: syntax error"},
    {"[]", "f: line 1: this is not a JSON object"},
    {"7", "f: line 1: this is not a JSON object"},
    {"{\n\"id\": 1,\n}", "f: line 3: syntax error"},
    {"{\n\"id\": 1,\n\"name\n", "f: line 3: syntax error"},
    {"{\n\"id\": 1\n", "f: line 2: syntax error"},
    {"{\n\"id\": 1\n}\n{", "f: line 4: syntax error"},
    {"{\n\"id\": 1e999\n}", "f: line 2: number overflow"},
    {"{\n\"name\": \"\xff\"\n}", "f: line 2: syntax error"},
    {"{\n\n\"ringing_timr\": 1}",
     "f: line 3: there is no key \"ringing_timr\"; did you mean \"ringing_timer\"?"},
    {"{\n\"id\": 1,\n\"ringing_timer\": \"1\"\n}",
     "f: line 3: ringing_timer: \"1\" is not a whole number of 32 bits"},
    {"{\"id\": 4294967296}", "f: line 1: id: 4294967296 is not a whole number of 32 bits"},
    {"{\n\"is_rcs_enabled\": 1}", "f: line 2: is_rcs_enabled: 1 is neither true nor false"},
    {"{\n\"http_password\": 1234}",
     "f: line 2: http_password: this is not a text but of type number"},
    {"{\n\"name\":\n{\"id\": [1,\n2]},\n\"min_se\": 1}",
     "f: line 2: name: this is not a text but of type object\nf: line 5: min_se: "},
    {"{\n\"id\": 1,\n\"name\": \"a\",\n\"id\": 2}", "f: line 4: id already stands in line 2"},
    {"\n{\n\"id\": 1}", "f: line 2: there is no \"name\""},
    {"{}", "f: line 1: there is no \"name\""},
    {"{\n\"id\": 1,\n\"name\": \"\"}",
     "f: line 3: name: it says which set is meant: it cannot be empty"},
    {"{\n\"name\": null}", "f: line 2: name: it says which set is meant: it cannot be empty"},
    // A password is not repeated, whatever is wrong with it.
    {"{\n\"http_password\": \"S3cret\n\"}", "f: line 2: syntax error"},
    {"{\n\"http_password\": \"S3cret\xff\"}", "f: line 2: syntax error"},
    {"{\n\"http_password\": \"S3cret", "f: line 2: syntax error"},
    {"{\n\"http_password\": \"S3cret\\q\"}", "f: line 2: syntax error"},
    {"{\n\"http_password\": S3cret}", "f: line 2: syntax error"},
    {"{\n\"http_password\": \"a\" S3cret}", "f: line 2: syntax error"},
    {"{\n\"http_password\": 3333e999}", "f: line 2: number overflow"},
    {"{\n\"http_password\": [\"S3cret\"]}", "f: line 2: http_password: this is not a text"},
    {"{\n\"http_password\": \"S3cret\\u0000\"}", "f: line 2: http_password: a text cannot"},
};

class WrongFiles : public ::testing::TestWithParam<FileRow> {};

TEST_P(WrongFiles, AreRefusedWithTheLine) {
    try {
        parse_settings(GetParam().document, "f");
        FAIL() << "taken";
    } catch (const Failure &failure) {
        EXPECT_EQ(failure.kind, FailureKind::kInput);
        EXPECT_EQ(failure.exit_status(), 1);
        EXPECT_THAT(failure.what(), HasSubstr(GetParam().message));
        EXPECT_THAT(failure.what(), Not(AnyOf(HasSubstr("S3"), HasSubstr("3333"))));
    }
}

INSTANTIATE_TEST_SUITE_P(All, WrongFiles, ::testing::ValuesIn(kWrongFiles));

TEST(SettingsFile, NamesAllLinesThatAreWrong) {
    try {
        parse_settings("{\n\"a\": 1,\n\"name\": \"n\",\n\"b\": 1\n}", "f");
        FAIL() << "taken";
    } catch (const Failure &failure) {
        EXPECT_EQ(failure.to_json()["lines"], Json({2, 4}));
        EXPECT_EQ(failure.to_json()["file"], "f");
    }
}

std::string refusal_of(const std::string &document, Json *told = nullptr) {
    try {
        parse_settings(document, "f");
    } catch (const Failure &failure) {
        if (told != nullptr)
            *told = failure.to_json();
        return failure.what();
    }
    return "taken";
}

std::string unknown_keys(std::size_t count) {
    std::string document = "{\"name\": \"n\"";
    for (std::size_t i = 0; i < count; ++i)
        document += ",\n\"key" + std::to_string(i) + "\": 1";
    return document + "}";
}

TEST(SettingsFile, CountsTheLinesThatAreWrongWhenTheyAreMany) {
    Json told;
    EXPECT_THAT(refusal_of(unknown_keys(20), &told), Not(HasSubstr("more")));
    EXPECT_EQ(told["lines"].size(), 20u);
    const std::string text = refusal_of(unknown_keys(20'000), &told);
    EXPECT_EQ(told["lines"].size(), 20u);
    EXPECT_EQ(std::count(text.begin(), text.end(), '\n'), 20);
    EXPECT_THAT(text, EndsWith("\nand 19980 more"));
}

TEST(SettingsFile, SuggestsNothingForALongKey) {
    const std::string key(300'000, 'e');
    EXPECT_EQ(refusal_of("{\"name\": \"n\", \"" + key + "\": 1}"),
              "f: line 1: there is no key \"" + key + "\"");
}

TEST(SettingsVerbs, NameTheLinesOfAFileThatIsNotThere) {
    const Outcome outcome = run_words({"settings", "import", "/nonexistent/a.json", "--json"});
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(Json::parse(outcome.output)["error"]["kind"], "input");
    EXPECT_THAT(outcome.error, HasSubstr("cannot read \"/nonexistent/a.json\": No such file"));
}

TEST(SettingsVerbs, ListKeysWithoutAService) {
    const Outcome text = run_words({"settings", "list-keys"});
    EXPECT_EQ(text.status, 0);
    EXPECT_THAT(text.output, HasSubstr("\naudio_port_start number\naudio_port_end number "
                                       "read-only\n"));
    EXPECT_THAT(text.output, HasSubstr("\nconference_factory_uri text\n"));
    const Outcome json = run_words({"settings", "list-keys", "--json"});
    const Json keys = Json::parse(json.output)["keys"];
    EXPECT_EQ(keys.size(), 334u);
    EXPECT_EQ(keys[3], Json({{"key", "is_rcs_enabled"}, {"type", "boolean"}, {"writable", true}}));
    EXPECT_EQ(Json::parse(run_words({"profile", "list-keys", "--json"}).output)["keys"].size(),
              51u);
}

} // namespace
} // namespace imsctl
