#include <platform/vtl/vtl.h>

#include <gtest/gtest.h>

#include <iterator>
#include <numeric>
#include <stdexcept>
#include <string>

namespace {

using Texts = ORXTValSlist<std::string>;

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
    if (number == 3) {
      throw std::runtime_error("third");
    }
  }
  ThrowingAtThird(ThrowingAtThird&&) = default;
  ThrowingAtThird& operator=(const ThrowingAtThird&) = default;
  int number;
};

TEST(ValueList, KeepsOrderAndEnds) {
  Texts texts;
  EXPECT_TRUE(texts.isEmpty());
  EXPECT_TRUE(texts.begin() == texts.end());
  std::string movable(100, 'm');
  texts.append("first");
  texts.append(std::move(movable));
  const std::string copied = "last";
  texts.append(copied);
  EXPECT_EQ(texts.size(), 3u);
  EXPECT_EQ(texts.front(), "first");
  EXPECT_EQ(texts.back(), copied);
  EXPECT_EQ((std::vector<std::string>(texts.cbegin(), texts.cend())),
            (std::vector<std::string>{"first", std::string(100, 'm'), "last"}));
  texts.removeFirst();
  texts.removeFirst();
  texts.removeFirst();
  EXPECT_TRUE(texts.isEmpty());
  texts.append("again");
  EXPECT_EQ(texts.front(), texts.back());
  texts.append(texts.front());  // a value of the list itself
  EXPECT_EQ(texts, (Texts{"again", "again"}));
}

TEST(ValueList, IteratesForwardAndChangesValues) {
  ORXTValSlist<int> numbers{1, 2, 3};
  for (int& number : numbers) {
    number *= 2;
  }
  ORXTValSlist<int>::const_iterator at = numbers.begin();
  EXPECT_EQ(*at++, 2);
  EXPECT_EQ(*at, 4);
  EXPECT_EQ(std::distance(numbers.begin(), numbers.end()), 3);
  ORXTValSlist<int> copied;
  std::copy(numbers.cbegin(), numbers.cend(), std::back_inserter(copied));
  EXPECT_EQ(copied, (ORXTValSlist<int>{2, 4, 6}));
}

TEST(ValueList, CopiesAndMoves) {
  Texts source{"a", "b"};
  Texts copy(source);
  copy.append("c");
  EXPECT_EQ(source, (Texts{"a", "b"}));
  EXPECT_NE(source, copy);
  const std::string* address = &copy.front();
  Texts moved(std::move(copy));
  EXPECT_EQ(&moved.front(), address);
  EXPECT_TRUE(copy.isEmpty());
  copy.append("reused");
  EXPECT_EQ(copy, (Texts{"reused"}));
  source = moved;
  EXPECT_EQ(source, moved);
  const Texts& itself = source;
  source = itself;
  EXPECT_EQ(source.size(), 3u);
  source = std::move(copy);
  EXPECT_EQ(source, (Texts{"reused"}));
  source.appendList(std::move(moved));
  EXPECT_EQ(source, (Texts{"reused", "a", "b", "c"}));
  EXPECT_TRUE(moved.isEmpty());
  source.append("d");
  EXPECT_EQ(source.back(), "d");
}

TEST(ValueList, ComparesLengthAndValues) {
  EXPECT_EQ(Texts(), Texts());
  EXPECT_NE(Texts({"a"}), Texts());
  EXPECT_NE(Texts({"a"}), Texts({"a", "b"}));
  EXPECT_NE(Texts({"a", "b"}), Texts({"b", "a"}));
}

TEST(ValueList, ReturnsEveryNodeToItsAllocator) {
  using List = ORXTValSlist<std::string, CountingAllocator<std::string>>;
  long left = 0;
  long right = 0;
  {
    List a{CountingAllocator<std::string>(&left)};
    List b{CountingAllocator<std::string>(&right)};
    a.append("one");
    a.append("two");
    b.append("three");
    b = std::move(a);  // the allocators differ, so the values move and the nodes do not
    EXPECT_EQ(left, 0);
    EXPECT_EQ(right, 2);
    EXPECT_EQ(b.back(), "two");
    a = b;
    EXPECT_EQ(left, 2);
    b.clear();
    EXPECT_EQ(right, 0);
  }
  EXPECT_EQ(left, 0);
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
  constexpr int kCount = 1000000;
  ORXTValSlist<int> numbers;
  for (int number = 0; number < kCount; ++number) {
    numbers.append(number);
  }
  const ORXTValSlist<int> copy(numbers);
  EXPECT_EQ(copy, numbers);
  EXPECT_EQ(std::accumulate(copy.begin(), copy.end(), 0LL), 499999500000LL);
  numbers.clear();
  EXPECT_TRUE(numbers.isEmpty());
}

}  // namespace
