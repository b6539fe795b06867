#include <tests/core/ConfigHelpers.h>
#include <transform/core/AttributeSet.h>

#include <QRegularExpression>
#include <gtest/gtest.h>

#include <random>

namespace {

QStringList united(QStringList left, const QStringList& right) {
  left += right;
  left.removeDuplicates();
  return left;
}

// Sets are made of each other at random, and each must be what the same steps make of plain lists.
TEST(AttributeSet, IsAListInWhichEachNameStandsOnce) {
  std::mt19937 random(7);
  const auto below = [&random](std::size_t limit) { return random() % limit; };
  const QString shapes[] = {"a%1", "l%1{}", "l{}.m%1", "l%1{}.m{}.n"};
  const auto name = [&] { return shapes[below(4)].arg(below(300)); };
  for (int round = 0; round < 200; ++round) {
    std::vector<std::pair<AttributeSet, QStringList>> made(4);
    for (int step = 0; step < 60; ++step) {
      auto [set, list] = made[below(made.size())];
      switch (below(5)) {
        case 0:
          for (std::size_t count = below(40); count > 0; --count) {
            const QString added = name();
            set.add(added);
            list = united(list, {added});
          }
          break;
        case 1:
        case 2: {
          const auto& other = made[below(made.size())];
          set.add(other.first);
          list = united(list, other.second);
          break;
        }
        case 3: {
          const QStringList some = united(list.mid(int(below(3)), int(below(50))), {name(), name()});
          const QSet<QString> wanted(some.begin(), some.end());
          set = below(8) == 0 ? set.only(wanted) : set;
          if (set.size() < list.size())
            list.erase(std::remove_if(list.begin(), list.end(),
                                      [&](const QString& each) { return !wanted.contains(each); }),
                       list.end());
          break;
        }
        default:
          if (below(8) == 0) {
            set = set.withoutLists();
            list = list.filter(QRegularExpression("^[^{]*$"));
          }
      }
      ASSERT_EQ(set.names(), list);
      made[below(made.size())] = {set, list};
    }
    for (const auto& [set, list] : made) {
      for (const QString& each : list)
        ASSERT_TRUE(set.contains(each));
      ASSERT_FALSE(set.contains("b"));
    }
  }
}

TEST(AttributeSet, ListsAreThereWithTheirMembers) {
  AttributeSet set(words("a l{} l{}.m m{}.n{}.o"));
  for (const char* held : {"a", "l{}", "l{0}", "l{}.m", "l{12}.m", "m{}", "m{3}", "m{}.n{}", "m{1}.n{2}.o"})
    EXPECT_TRUE(set.holds(held)) << held;
  for (const char* absent : {"", "l", "l{x}.m", "l{}.n", "n{}", "m{", "m{}.n"})
    EXPECT_FALSE(set.holds(absent)) << absent;
  EXPECT_FALSE(set.withoutLists().holds("l{}"));
}

}  // namespace
