#pragma once

// The members of an object of the host's JSON (see Json in JsonReader.h), in
// the order they were added: exports and stored texts keep their members in
// the order they were written.
//
// A vector of (key, value) pairs like the JSON library's own ordered map, but
// with a key that is not const: a pair then moves without a chance of
// throwing, so a vector that grows while an object is parsed moves the
// members it holds instead of copying each, nested values and all.
//
// The interface is the one the JSON library asks of its object type. A key
// is looked up by its text (anything that converts to a string_view), so a
// member asked for by a string literal is found without making a string.

#include <cstddef>
#include <functional>
#include <initializer_list>
#include <iterator>
#include <memory>
#include <stdexcept>
#include <string>
#include <string_view>
#include <type_traits>
#include <utility>
#include <vector>

namespace Trellis {
namespace Host {

template <class Key, class T, class IgnoredLess = std::less<Key>,
          class IgnoredAllocator = std::allocator<std::pair<const Key, T>>>
struct JsonMembers : std::vector<std::pair<Key, T>> {
    static_assert(std::is_same<Key, std::string>::value, "the keys of the host's JSON are std::string");

    using Container = std::vector<std::pair<Key, T>>;
    using key_type = Key;
    using mapped_type = T;
    using value_type = typename Container::value_type;
    using size_type = typename Container::size_type;
    using iterator = typename Container::iterator;
    using const_iterator = typename Container::const_iterator;
    // Transparent: the library then passes keys of other types (const char*,
    // string_view) through as they are.
    using key_compare = std::equal_to<>;

    JsonMembers() noexcept = default;
    template <class It>
    JsonMembers(It first, It last) : Container(first, last) {}
    JsonMembers(std::initializer_list<value_type> init) : Container(init) {}

    template <class K>
    using IfText = std::enable_if_t<std::is_convertible<const K&, std::string_view>::value, int>;

    template <class K, IfText<K> = 0>
    iterator find(const K& key) {
        return this->begin() + static_cast<std::ptrdiff_t>(IndexOf(key));
    }
    template <class K, IfText<K> = 0>
    const_iterator find(const K& key) const {
        return this->begin() + static_cast<std::ptrdiff_t>(IndexOf(key));
    }
    template <class K, IfText<K> = 0>
    size_type count(const K& key) const {
        return IndexOf(key) == this->size() ? 0 : 1;
    }

    // Adds the member unless the key is there already; the second of the
    // result tells whether it was added.
    template <class K, class V, IfText<K> = 0>
    std::pair<iterator, bool> emplace(K&& key, V&& value) {
        iterator it = find(key);
        if (it != this->end()) return {it, false};
        Container::emplace_back(std::forward<K>(key), std::forward<V>(value));
        return {std::prev(this->end()), true};
    }

    template <class K, IfText<K> = 0>
    T& operator[](K&& key) {
        return emplace(std::forward<K>(key), T()).first->second;
    }
    template <class K, IfText<K> = 0>
    const T& operator[](const K& key) const {
        return at(key);
    }

    template <class K, IfText<K> = 0>
    T& at(const K& key) {
        iterator it = find(key);
        if (it == this->end()) throw std::out_of_range("key not found");
        return it->second;
    }
    template <class K, IfText<K> = 0>
    const T& at(const K& key) const {
        const_iterator it = find(key);
        if (it == this->end()) throw std::out_of_range("key not found");
        return it->second;
    }

    template <class K, IfText<K> = 0>
    size_type erase(const K& key) {
        iterator it = find(key);
        if (it == this->end()) return 0;
        Container::erase(it);
        return 1;
    }
    iterator erase(iterator pos) { return Container::erase(pos); }
    iterator erase(iterator first, iterator last) { return Container::erase(first, last); }

    std::pair<iterator, bool> insert(value_type&& member) {
        return emplace(std::move(member.first), std::move(member.second));
    }
    std::pair<iterator, bool> insert(const value_type& member) { return emplace(member.first, member.second); }
    template <class It, class = std::enable_if_t<std::is_convertible<
                            typename std::iterator_traits<It>::iterator_category, std::input_iterator_tag>::value>>
    void insert(It first, It last) {
        for (; first != last; ++first) insert(*first);
    }

    // The place of the member with the key; size() when there is none.
    size_type IndexOf(std::string_view key) const {
        const value_type* members = this->data();
        const size_type count = this->size();
        for (size_type i = 0; i < count; ++i)
            if (members[i].first.size() == key.size() &&
                std::char_traits<char>::compare(members[i].first.data(), key.data(), key.size()) == 0)
                return i;
        return count;
    }
};

}  // namespace Host
}  // namespace Trellis
