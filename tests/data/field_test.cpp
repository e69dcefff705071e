// What a declaration of a field may say: most of it is checked by the compiler, and must not compile when it is wrong.
#include "data/families.h"
#include "files/declare_field.h"

#include <gtest/gtest.h>

namespace {

struct Sample
{
    double number = 0;
    std::int32_t integer = 0;
    bool flag = false;
    std::string text;
    HDDateTime time;
    double numbers[2] = {};
    float single = 0;
};
struct Outer
{
    Sample inner;
};

template <auto... Path>
constexpr int Kinds()
{
    return requires
    {
        Number<Path...>("x");
    }
    +requires
    {
        Integer<Path...>("x");
    }
    +requires
    {
        Boolean<Path...>("x");
    }
    +requires
    {
        Text<Path...>("x");
    }
    +requires
    {
        FileName<Path...>("x");
    }
    +requires
    {
        DateTime<Path...>("x");
    };
}

// A kind takes members of its type only.
static_assert(Kinds<&Sample::number>() == 1 && requires { Number<&Sample::number>("x"); });
static_assert(Kinds<&Sample::integer>() == 1 && requires { Integer<&Sample::integer>("x"); });
static_assert(Kinds<&Sample::flag>() == 1 && requires { Boolean<&Sample::flag>("x"); });
static_assert(Kinds<&Sample::text>() == 2 && requires { Text<&Sample::text>("x"); });
static_assert(Kinds<&Sample::time>() == 1 && requires { DateTime<&Sample::time>("x"); });
static_assert(Kinds<&Sample::numbers>() == 0);
static_assert(Kinds<&Sample::single>() == 0);
static_assert(Kinds<&Outer::inner>() == 0);
// What counts is where a path ends.
static_assert(Kinds<&Outer::inner, &Sample::number>() == 1 &&
              requires { Number<&Outer::inner, &Sample::number>("x"); });

template <std::size_t Index>
constexpr bool HasElement = requires
{
    NumberAt<Index, &Sample::numbers>("x");
};
template <std::size_t Index>
constexpr bool HasFlag = requires
{
    BooleanAt<Index, &Sample::numbers>("x");
};
static_assert(HasElement<1> && !HasElement<2> && !HasFlag<0>);

constexpr Field plainNumber = Plain<double>("x"), plainText = Plain<std::string>("x");
template <const Field& element>
constexpr bool TakesElement = requires
{
    PlainGroup<element, &HDWLMark::MarkLevels>("x");
};
static_assert(TakesElement<plainNumber>);
#ifndef __SANITIZE_ADDRESS__ // where addresses are instrumented, it is no constant that two of them differ
static_assert(!TakesElement<plainText>);
#endif

} // namespace

TEST(Fields, AreReachedThroughObjectsThatAreConst)
{
    Outer outer;
    outer.inner.numbers[1] = 2.5;
    const Outer& object = outer;
    const Field element = NumberAt<1, &Outer::inner, &Sample::numbers>("x");
    EXPECT_EQ(element.constAddress(&object), &outer.inner.numbers[1]);
    EXPECT_EQ(Visit(element, &object, Overloads{[](const double& value) { return value; }, [](auto&&) { return 0.0; }}),
              2.5);

    HDWLMark mark;
    mark.MarkLevels = {1, 2};
    const HD_RiverPos& record = mark;
    EXPECT_EQ(HDWLMark::DeclaredFields()[0].GroupIn(&record).size(), 2u);
}

TEST(Fields, SayWhatIsKnownAboutThemInOneDeclaration)
{
    const Field field = Number<&Sample::number>("x", UnitGroup::Width).Range(0.5, 1).Digits(3).OptionalTail();
    EXPECT_EQ(std::tuple(field.bounds, field.digits, field.optionalTail, field.unit),
              std::tuple(Bounds{0.5, 1.0}, 3, true, UnitGroup::Width));
}
