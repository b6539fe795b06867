#include <platform/vtl/vtl.h>

#include <gtest/gtest.h>

#include <list>
#include <numeric>
#include <random>
#include <stdexcept>
#include <string>

namespace {

// Counts what is allocated, and does not go along with a moved or copied list.
template <class T>
struct CountingAllocator {
  using value_type = T;
  using is_always_equal = std::false_type;

  explicit CountingAllocator(long* counter) : live(counter) {}
  template <class Other>
  CountingAllocator(const CountingAllocator<Other>& other) : live(other.live) {}

  T* allocate(std::size_t count) {
    *live += static_cast<long>(count);
    return std::allocator<T>().allocate(count);
  }
  void deallocate(T* block, std::size_t count) {
    *live -= static_cast<long>(count);
    std::allocator<T>().deallocate(block, count);
  }
  template <class Other>
  bool operator==(const CountingAllocator<Other>& other) const {
    return live == other.live;
  }
  template <class Other>
  bool operator!=(const CountingAllocator<Other>& other) const {
    return live != other.live;
  }

  long* live;
};

struct ThrowingAtThird {
  explicit ThrowingAtThird(int value) : number(value) {}
  ThrowingAtThird(const ThrowingAtThird& other) : number(other.number) {
    if (number == 3)
      throw std::runtime_error("third");
  }
  ThrowingAtThird(ThrowingAtThird&&) = default;
  ThrowingAtThird& operator=(const ThrowingAtThird&) = default;
  int number;
};

// Whatever is done to three lists of two allocators, they hold what other lists hold, and not one node more.
TEST(ValueList, DoesWhatOtherListsDo) {
  using List = ORXTValSlist<std::string, CountingAllocator<std::string>>;
  using Model = std::list<std::string>;
  long live[] = {0, 0};
  {
    List lists[] = {List(CountingAllocator<std::string>(&live[0])),
                    List(CountingAllocator<std::string>(&live[1])),
                    List(CountingAllocator<std::string>(&live[1]))};
    Model models[3];
    std::mt19937 random(3);
    for (int step = 0; step < 20000; ++step) {
      const std::size_t one = random() % 3;
      const std::size_t other = random() % 3;
      List& list = lists[one];
      Model& model = models[one];
      const auto choice = random() % 9;
      if (choice == 0) {
        list.clear();
        model.clear();
      } else if (choice == 1) {
        list = lists[other];
        model = Model(models[other]);
      } else if (choice == 2 && one != other) {
        list = std::move(lists[other]);
        model = std::exchange(models[other], Model());
      } else if (choice == 3 && one + other == 3) {  // of equal allocators
        list.appendList(std::move(lists[other]));
        model.splice(model.end(), models[other]);
      } else if (choice == 4 && !model.empty()) {
        list.append(list.front());  // a value of the list itself
        model.push_back(model.front());
      } else if (choice == 5 && !model.empty()) {
        list.removeFirst();
        model.pop_front();
      } else {
        std::string value(step % 40, 'v');
        model.push_back(value);
        list.append(std::move(value));
      }
      for (std::size_t i = 0; i < 3; ++i) {
        ASSERT_TRUE(std::equal(lists[i].cbegin(), lists[i].cend(), models[i].begin(), models[i].end()))
            << step;
        ASSERT_EQ(lists[i].size(), models[i].size());
        ASSERT_EQ(lists[i].isEmpty(), models[i].empty());
        ASSERT_TRUE(models[i].empty() || lists[i].back() == models[i].back());
        ASSERT_EQ(lists[0] == lists[i], models[0] == models[i]);
      }
      ASSERT_EQ(live[0], static_cast<long>(models[0].size()));
      ASSERT_EQ(live[1], static_cast<long>(models[1].size() + models[2].size()));
    }
    const std::string* first = (lists[1].append("x"), &lists[1].front());
    const List moved(std::move(lists[1]));
    EXPECT_EQ(&moved.front(), first);
    EXPECT_TRUE(lists[1].isEmpty());
  }
  EXPECT_EQ(live[0] + live[1], 0);
}

TEST(ValueList, StaysAsItWasWhenACopyFails) {
  long live = 0;
  using List = ORXTValSlist<ThrowingAtThird, CountingAllocator<ThrowingAtThird>>;
  {
    List list{CountingAllocator<ThrowingAtThird>(&live)};
    for (int number = 1; number <= 4; ++number) {
      list.append(ThrowingAtThird(number));
    }
    EXPECT_THROW(List copy(list), std::runtime_error);
    EXPECT_EQ(live, 4);
    List target{CountingAllocator<ThrowingAtThird>(&live)};
    target.append(ThrowingAtThird(7));
    EXPECT_THROW(target = list, std::runtime_error);
    ASSERT_EQ(target.size(), 1u);
    EXPECT_EQ(target.front().number, 7);
    const ThrowingAtThird third(3);
    EXPECT_THROW(target.append(third), std::runtime_error);
    EXPECT_EQ(target.size(), 1u);
  }
  EXPECT_EQ(live, 0);
}

TEST(ValueList, HoldsAMillionValues) {
  ORXTValSlist<int> numbers;
  for (int number = 0; number < 1000000; ++number)
    numbers.append(number);
  for (int& number : numbers)
    number *= 2;
  ORXTValSlist<int> copy(numbers);
  EXPECT_EQ(copy, numbers);
  EXPECT_EQ(std::accumulate(copy.cbegin(), copy.cend(), 0LL), 999999000000LL);
  copy.append(1);
  EXPECT_NE(copy, numbers);
  copy.removeFirst();
  EXPECT_NE(copy, numbers);
}

}  // namespace
