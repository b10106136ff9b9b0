#pragma once

#include <atomic>
#include <cassert>

#include "vesk_hdl/netlist/Object.h"
#include "vesk_hdl/netlist/Values.h"
#include "vesk_hdl/netlist/storage/PinFamily.h"

namespace Vesk_Hdl {

/// What an object shares with its copies until one of them changes. The pins of a million instances
/// have the names and polarities of their components' pins, and so each of them costs little more
/// than a pointer to its signal.
///
/// A record is in the memory block of the text of its name, after the characters: the two are
/// always allocated together. A new name makes a new record. The block is freed when the record and
/// all copies of the text are gone.
///
/// Few objects have more than a name and a kind. Their records are of a derived class, which
/// `content` says; a virtual table would cost each name a pointer.
///
/// Invariant: a record is changed by its only owner, and a change of a name or polarity is reported
/// first (NoteChange). See docs/architecture.md, "Storage and its invariants".
struct Object::Record {
    enum Content : char { NAME, COMMENT, NETLIST, PIN };

    explicit Record(Content recordContent = NAME) : content(recordContent) {}
    /// Copies all but the name, which comes with the block.
    Record(Record const &model) : objectType(model.objectType), content(model.content) {}
    Record &operator=(Record const &) = delete;

    inline Basis::StringBase<char> const &GetComment() const;
    /// The comment for writing. The record is not shared, and its content is not NAME.
    inline Basis::StringBase<char> &OwnComment();
    /// Called before the name, kind or polarity changes, so that no index of names or order of pins
    /// is used that no longer holds.
    inline void NoteChange() const;

    Basis::StringBase<char> name;
    std::atomic<unsigned int> owners{1};
    signed char objectType = 0; ///< an ObjectType
    Content const content;
};

/// The record of an object that is no pin and has a comment.
struct Object::CommentRecord : Object::Record {
    /// For an object that gets its first comment, and for the record of a netlist, which has one,
    /// too.
    explicit CommentRecord(Record const &model, Content recordContent = COMMENT)
        : Record(recordContent), comment(model.GetComment()) {
        objectType = model.objectType;
    }
    CommentRecord(CommentRecord const &) = default;

    Basis::StringBase<char> comment;
};

/// The record of a netlist of a model in an engine: the engine finds the model by this name.
struct Object::NetlistRecord : Object::CommentRecord {
    NetlistRecord(Record const &model, unsigned long &counter)
        : CommentRecord(model, NETLIST), renames(counter) {}
    NetlistRecord(NetlistRecord const &) = default;

    unsigned long &renames; ///< the counter of the engine, which outlives the netlist
};

/// The record of a pin.
struct Object::PinRecord : Object::Record {
    explicit PinRecord(Polarity::Value pinPolarity) : Record(PIN), polarity(pinPolarity) {
        objectType = OBJECT_PIN;
    }
    PinRecord(PinRecord const &) = default;

    Polarity::Value polarity;
    PinFamilyPtr family; ///< null for a pin that no component made
    BitVectorValue defaultValue;
    Basis::StringBase<char> comment;
};

inline Basis::StringBase<char> const &Object::Record::GetComment() const {
    static Basis::StringBase<char> const none;
    return content == NAME ? none : const_cast<Record *>(this)->OwnComment();
}

inline Basis::StringBase<char> &Object::Record::OwnComment() {
    assert(content != NAME && "this record has no room for a comment");
    return content == PIN ? static_cast<PinRecord *>(this)->comment
                          : static_cast<CommentRecord *>(this)->comment;
}

inline void Object::Record::NoteChange() const {
    if (content == NETLIST)
        ++static_cast<NetlistRecord const *>(this)->renames;
    else if (content == PIN && static_cast<PinRecord const *>(this)->family)
        static_cast<PinRecord const *>(this)->family->NoteChange();
}

} // namespace Vesk_Hdl
