// SPDX-License-Identifier: Apache-2.0
// What follows for a method from the types of the function that it asks.
#include "sim/bus/ask.hpp"

#include "sim/bus/tell.hpp"

#include <algorithm>
#include <array>
#include <gtest/gtest.h>

namespace sim {
namespace {

using std::int32_t;
using enum Caller;

enum class Colour : int32_t { kRed = 1, kBlue = 2 };

struct Shape {
    Colour colour = Colour::kRed;
    std::array<std::string, 2> names;
    bool filled = false;
    bool operator==(const Shape &) const = default;
};

// Travels as a number, and only when it is even.
struct Even {
    int32_t number = 0;
};

struct Entry {
    int32_t id = 0;
    std::string name;
};

} // namespace

template <>
struct wire::Form<Even> {
    static constexpr std::string_view kSignature = "i";
    static Answer<Even> read(const Variant &member) {
        const auto number = wire::read<int32_t>(member.get());
        if (number % 2 != 0)
            return refuse(Result::kInvalidArgument, "{} is odd", number);
        return Even{number};
    }
};

template <>
inline constexpr std::array wire::kKeys<Entry>{"id", "called"};

namespace {

class Model {
  public:
    Status touch(int slot, int32_t id) {
        asked = fmt::format("{} touch {}", slot, id);
        return Done{};
    }
    Status look(std::string_view name, std::uint8_t tone) const {
        return refuse(Result::kFailed, "{} {}", name, tone);
    }
    Answer<int> draw(int slot, const Shape &drawn) {
        asked = fmt::format("{} draw", slot);
        shape = drawn;
        return 7;
    }
    Status halve(int slot, Even number, Even other) {
        asked = fmt::format("{} halve {} {}", slot, number.number, other.number);
        return Done{};
    }
    std::vector<Entry> list(int) const { return {{1, "a"}, {2, "b"}}; }
    ResultLast<Shape> shape_of(int) const { return {shape}; }

    std::string asked;
    Shape shape;
};

class Other {
  public:
    bool ready(int slot) const { return slot == 1; }
};

Answer<std::tuple<int32_t, std::string>> introduce(Model &, const Request &request, int32_t id) {
    return std::tuple(id, request.connection);
}

constexpr MethodRow<Model, Other> kRows[] = {
    {"Touch", ask<&Model::touch>, kFirstArgument},
    {"TouchLast", ask<&Model::touch>, kLastArgument},
    {"TouchMore", ask<&Model::touch, std::string, bool>, kConnection},
    {"Look", ask<&Model::look>, kAnybody, 1},
    {"Draw", ask<&Model::draw>, kFirstArgument},
    {"Halve", ask<&Model::halve, Even>, kConnection},
    {"List", ask<&Model::list>, kConnection},
    {"ShapeOf", ask<&Model::shape_of>, kConnection},
    {"Ready", ask<&Other::ready>, kConnection},
    {"Introduce", ask<introduce>, kConnection},
};

class Asking : public testing::Test {
  protected:
    const Method &method(std::string_view member) {
        return *std::ranges::find(methods_, member, &Method::member);
    }
    template <typename... Ts>
    Answer<Variant> call(std::string_view member, const Ts &...arguments) {
        const auto body = wire::pack(arguments...);
        EXPECT_EQ(g_variant_get_type_string(body.get()), method(member).in);
        auto answer = method(member).handler({1, ":1.5", body});
        if (answer) {
            EXPECT_EQ(g_variant_get_type_string((*answer).get()), method(member).out);
        }
        return answer;
    }
    template <typename... Ts>
    std::string print(std::string_view member, const Ts &...arguments) {
        const auto answer = call(member, arguments...);
        return answer ? (*answer).print() : answer.refusal().reason;
    }

    Model model_;
    Other other_;
    std::vector<Method> methods_ = bind_methods(kRows, model_, other_);
};

TEST_F(Asking, TheSignaturesFollowFromTheTypes) {
    const std::tuple<std::string_view, std::string_view, std::string_view> expected[] = {
        {"Touch", "(ii)", "(i)"},      {"TouchLast", "(ii)", "(i)"}, {"TouchMore", "(isb)", "(i)"},
        {"Look", "(sy)", "(i)"},       {"Draw", "(iissb)", "(ii)"},  {"Halve", "(iii)", "(i)"},
        {"List", "()", "(iuaa{sv})"},  {"ShapeOf", "()", "(issbi)"}, {"Ready", "()", "(ib)"},
        {"Introduce", "(i)", "(iis)"},
    };
    ASSERT_EQ(methods_.size(), std::size(expected));
    for (const auto &[member, in, out] : expected) {
        EXPECT_EQ(method(member).in, in) << member;
        EXPECT_EQ(method(member).out, out) << member;
    }
}

TEST_F(Asking, TheApplicationIsNoArgumentOfTheFunction) {
    EXPECT_EQ(print("Touch", 9, 4), "(0,)");
    EXPECT_EQ(model_.asked, "1 touch 4");
    EXPECT_EQ(print("TouchLast", 5, 9), "(0,)");
    EXPECT_EQ(model_.asked, "1 touch 5");
}

TEST_F(Asking, ArgumentsWithoutEffectComeLast) {
    EXPECT_EQ(print("TouchMore", 6, std::string("x"), true), "(0,)");
    EXPECT_EQ(model_.asked, "1 touch 6");
}

TEST_F(Asking, ARefusalIsHandedOn) {
    const auto answer = call("Look", std::string("there"), std::uint8_t{3});
    ASSERT_FALSE(answer);
    EXPECT_EQ(answer.code(), Result::kFailed);
    EXPECT_EQ(answer.refusal().reason, "there 3");
    EXPECT_EQ(method("Look").password, 1U);
}

TEST_F(Asking, ARecordTravelsMemberByMember) {
    EXPECT_EQ(print("Draw", 9, Colour::kBlue, std::string("a"), std::string("b"), true), "(0, 7)");
    EXPECT_EQ(model_.asked, "1 draw");
    EXPECT_EQ(model_.shape, (Shape{Colour::kBlue, {"a", "b"}, true}));
}

TEST_F(Asking, TheFirstArgumentThatIsWrongRefuses) {
    EXPECT_EQ(print("Halve", 2, 4, 6), "(0,)");
    EXPECT_EQ(model_.asked, "1 halve 2 4");
    model_.asked.clear();
    EXPECT_EQ(print("Halve", 2, 5, 7), "5 is odd");
    EXPECT_EQ(print("Halve", 3, 5, 6), "3 is odd");
    // One without effect is read all the same.
    EXPECT_EQ(print("Halve", 2, 4, 7), "7 is odd");
    EXPECT_EQ(model_.asked, "");
}

TEST_F(Asking, AListHasItsLengthAndADictionaryForEachEntry) {
    EXPECT_EQ(print("List"),
              "(0, 2, [{'id': <1>, 'called': <'a'>}, {'id': <2>, 'called': <'b'>}])");
}

TEST_F(Asking, TheResultMayComeLast) {
    model_.shape = {Colour::kBlue, {"a", "b"}, true};
    EXPECT_EQ(print("ShapeOf"), "(2, 'a', 'b', true, 0)");
    EXPECT_EQ(method("ShapeOf").result_index, 4U);
    EXPECT_EQ(method("Touch").result_index, 0U);
}

TEST_F(Asking, EachFunctionHasItsOwnModel) {
    EXPECT_EQ(print("Ready"), "(0, true)");
    EXPECT_EQ(print("Introduce", 3), "(0, 3, ':1.5')");
}

auto name_of(const Entry &entry) {
    return std::tuple(entry.name);
}

template <int32_t kRest>
std::optional<std::tuple<int32_t>> with_rest(const Even &event) {
    return event.number % 4 == kRest ? std::optional(std::tuple(event.number)) : std::nullopt;
}

constexpr SignalTable kSignals{
    SignalRow<Shape>{"ShapeDrawn"},
    SignalRow{"EntryMade", name_of},
    SignalRow{"Fours", &with_rest<0>},
    SignalRow{"Twos", &with_rest<2>},
};

TEST(Telling, TheSignaturesFollowFromTheTypes) {
    const std::pair<std::string_view, std::string_view> expected[] = {
        {"ShapeDrawn", "(issb)"}, {"EntryMade", "(s)"}, {"Fours", "(i)"}, {"Twos", "(i)"}};
    ASSERT_EQ(kSignals.infos().size(), std::size(expected));
    for (std::size_t i = 0; i < std::size(expected); ++i) {
        EXPECT_EQ(kSignals.infos()[i].member, expected[i].first);
        EXPECT_EQ(kSignals.infos()[i].signature, expected[i].second);
    }
}

TEST(Telling, AnEventBecomesTheSignalOfItsRow) {
    const std::variant<Shape, Entry, Even> events[] = {Shape{Colour::kBlue, {"a", "b"}, true},
                                                       Entry{3, "c"}, Even{8}, Even{6}};
    const std::pair<std::string_view, std::string> expected[] = {
        {"ShapeDrawn", "(2, 'a', 'b', true)"},
        {"EntryMade", "('c',)"},
        {"Fours", "(8,)"},
        {"Twos", "(6,)"}};
    for (std::size_t i = 0; i < std::size(events); ++i) {
        const auto signal = kSignals.signal_of(events[i]);
        EXPECT_EQ(signal.member, expected[i].first);
        EXPECT_EQ(signal.body.print(), expected[i].second);
    }
}

} // namespace
} // namespace sim
