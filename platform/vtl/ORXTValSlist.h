// Singly linked list of values.
//
// Appending and taking from the front are constant in time; size() is, too. Iterators, references and
// pointers to a value hold until the value is removed or the list destroyed; moving a list keeps them when
// the allocators are equal. Nothing recurses, so a list may be of any length. An exception of a value's copy
// leaves the list as it was.
#pragma once

#include <algorithm>
#include <cstddef>
#include <initializer_list>
#include <iterator>
#include <memory>
#include <type_traits>
#include <utility>

template <class T, class Allocator = std::allocator<T>>
class ORXTValSlist {
  struct Node {
    template <class... Arguments>
    explicit Node(Arguments&&... arguments) : value(std::forward<Arguments>(arguments)...) {}

    T value;
    Node* next = nullptr;
  };

  template <class Value>
  class Iterator {
   public:
    using iterator_category = std::forward_iterator_tag;
    using value_type = T;
    using difference_type = std::ptrdiff_t;
    using pointer = Value*;
    using reference = Value&;

    Iterator() = default;
    // An iterator also serves as a constant one.
    template <class Other,
              class = std::enable_if_t<std::is_same_v<const Other, Value> && !std::is_const_v<Other>>>
    Iterator(const Iterator<Other>& other) : m_node(other.m_node) {}

    reference operator*() const { return m_node->value; }
    pointer operator->() const { return &m_node->value; }
    Iterator& operator++() {
      m_node = m_node->next;
      return *this;
    }
    Iterator operator++(int) {
      Iterator before = *this;
      ++*this;
      return before;
    }
    friend bool operator==(const Iterator& a, const Iterator& b) { return a.m_node == b.m_node; }
    friend bool operator!=(const Iterator& a, const Iterator& b) { return a.m_node != b.m_node; }

   private:
    friend class ORXTValSlist;
    template <class>
    friend class Iterator;
    explicit Iterator(Node* node) : m_node(node) {}

    Node* m_node = nullptr;
  };

  using NodeAllocator = typename std::allocator_traits<Allocator>::template rebind_alloc<Node>;
  using NodeTraits = std::allocator_traits<NodeAllocator>;

 public:
  using value_type = T;
  using allocator_type = Allocator;
  using size_type = std::size_t;
  using difference_type = std::ptrdiff_t;
  using reference = T&;
  using const_reference = const T&;
  using iterator = Iterator<T>;
  using const_iterator = Iterator<const T>;

  ORXTValSlist() = default;
  explicit ORXTValSlist(const Allocator& allocator) : m_allocator(allocator) {}
  ORXTValSlist(std::initializer_list<T> values, const Allocator& allocator = Allocator())
      : m_allocator(allocator) {
    appendAll(values);
  }
  ORXTValSlist(const ORXTValSlist& other)
      : m_allocator(NodeTraits::select_on_container_copy_construction(other.m_allocator)) {
    appendAll(other);
  }
  ORXTValSlist(ORXTValSlist&& other) noexcept : m_allocator(other.m_allocator) { takeNodes(other); }
  ~ORXTValSlist() { clear(); }

  ORXTValSlist& operator=(const ORXTValSlist& other) {
    if (this != &other) {
      ORXTValSlist copy(other.begin(), other.end(), assignedAllocator(other));
      clear();
      if constexpr (NodeTraits::propagate_on_container_copy_assignment::value) {
        m_allocator = other.m_allocator;
      }
      takeNodes(copy);
    }
    return *this;
  }
  ORXTValSlist& operator=(ORXTValSlist&& other) noexcept(
      NodeTraits::propagate_on_container_move_assignment::value || NodeTraits::is_always_equal::value) {
    constexpr bool propagates = NodeTraits::propagate_on_container_move_assignment::value;
    if (this == &other) {
      return *this;
    }
    if (!propagates && m_allocator != other.m_allocator) {
      // Nodes cannot change hands between unequal allocators.
      ORXTValSlist moved(std::make_move_iterator(other.begin()), std::make_move_iterator(other.end()),
                         get_allocator());
      clear();
      takeNodes(moved);
      other.clear();
      return *this;
    }
    clear();
    if constexpr (propagates) {
      m_allocator = other.m_allocator;
    }
    takeNodes(other);
    return *this;
  }

  void append(const T& value) { emplaceBack(value); }
  void append(T&& value) { emplaceBack(std::move(value)); }
  // For back-insert iterators.
  void push_back(const T& value) { emplaceBack(value); }
  void push_back(T&& value) { emplaceBack(std::move(value)); }

  // Moves all values of `other` behind the own ones; `other` is empty afterwards. The allocators must be
  // equal.
  void appendList(ORXTValSlist&& other) {
    if (this == &other || other.isEmpty()) {
      return;
    }
    (m_last != nullptr ? m_last->next : m_first) = other.m_first;
    m_last = other.m_last;
    m_size += other.m_size;
    other.forget();
  }

  // The list must not be empty.
  void removeFirst() {
    Node* first = m_first;
    m_first = first->next;
    if (m_first == nullptr) {
      m_last = nullptr;
    }
    --m_size;
    destroy(first);
  }

  void clear() noexcept {
    Node* node = m_first;
    forget();
    while (node != nullptr) {
      Node* next = node->next;
      destroy(node);
      node = next;
    }
  }

  size_type size() const noexcept { return m_size; }
  bool isEmpty() const noexcept { return m_first == nullptr; }

  // The list must not be empty.
  T& front() { return m_first->value; }
  const T& front() const { return m_first->value; }
  T& back() { return m_last->value; }
  const T& back() const { return m_last->value; }

  iterator begin() noexcept { return iterator(m_first); }
  iterator end() noexcept { return iterator(); }
  const_iterator begin() const noexcept { return const_iterator(m_first); }
  const_iterator end() const noexcept { return const_iterator(); }
  const_iterator cbegin() const noexcept { return begin(); }
  const_iterator cend() const noexcept { return end(); }

  allocator_type get_allocator() const { return allocator_type(m_allocator); }

  friend bool operator==(const ORXTValSlist& a, const ORXTValSlist& b) {
    return a.m_size == b.m_size && std::equal(a.begin(), a.end(), b.begin(), b.end());
  }
  friend bool operator!=(const ORXTValSlist& a, const ORXTValSlist& b) { return !(a == b); }

 private:
  template <class Input>
  ORXTValSlist(Input first, Input last, const NodeAllocator& allocator) : m_allocator(allocator) {
    try {
      for (; first != last; ++first) {
        emplaceBack(*first);
      }
    } catch (...) {
      clear();
      throw;
    }
  }

  template <class Range>
  void appendAll(const Range& values) {
    try {
      for (const T& value : values) {
        emplaceBack(value);
      }
    } catch (...) {
      clear();
      throw;
    }
  }

  template <class Value>
  void emplaceBack(Value&& value) {
    Node* node = NodeTraits::allocate(m_allocator, 1);
    try {
      NodeTraits::construct(m_allocator, node, std::forward<Value>(value));
    } catch (...) {
      NodeTraits::deallocate(m_allocator, node, 1);
      throw;
    }
    (m_last != nullptr ? m_last->next : m_first) = node;
    m_last = node;
    ++m_size;
  }

  void destroy(Node* node) noexcept {
    NodeTraits::destroy(m_allocator, node);
    NodeTraits::deallocate(m_allocator, node, 1);
  }

  NodeAllocator assignedAllocator(const ORXTValSlist& other) const {
    return NodeTraits::propagate_on_container_copy_assignment::value ? other.m_allocator : m_allocator;
  }

  // Only into an empty list.
  void takeNodes(ORXTValSlist& other) noexcept {
    m_first = other.m_first;
    m_last = other.m_last;
    m_size = other.m_size;
    other.forget();
  }

  void forget() noexcept {
    m_first = nullptr;
    m_last = nullptr;
    m_size = 0;
  }

  NodeAllocator m_allocator;
  Node* m_first = nullptr;
  Node* m_last = nullptr;
  size_type m_size = 0;
};
