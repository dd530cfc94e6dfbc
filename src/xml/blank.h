#pragma once

// What the model classes name of the reader's inside.
namespace raid {

struct Navigation;

namespace xml {
template <class Model>
struct Vocabulary;
struct Unread;
}  // namespace xml

/// The key to making a model object before its element is read. Only the reader has it.
class Blank {
    friend struct xml::Unread;
    Blank() = default;
};

}  // namespace raid
