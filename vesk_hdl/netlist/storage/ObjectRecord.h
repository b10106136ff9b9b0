#pragma once

#include <atomic>

#include "vesk_hdl/netlist/Object.h"
#include "vesk_hdl/netlist/Values.h"
#include "vesk_hdl/netlist/storage/PinFamily.h"

namespace Vesk_Hdl {

/// What an object shares with its copies until one of them changes: the pins of a million instances
/// are what their components' pins are, and so cost their signal alone.
///
/// A record lies in the memory block of its name's text, after the characters. A new name makes a
/// new record. The block is freed when the record and all copies of the text are gone.
///
/// Few objects have more than a name and a kind; their records are of a derived class, which
/// `content` names.
struct Object::Record {
    enum Content : char { NAME, COMMENT, NETLIST, PIN };

    explicit Record(Content recordContent = NAME) : content(recordContent) {}
    /// All but the name.
    Record(Record const &model) : objectType(model.objectType), content(model.content) {}
    Record &operator=(Record const &) = delete;

    inline Basis::StringBase<char> const &GetComment() const;
    /// Of a record that nobody shares and whose content is not NAME.
    inline Basis::StringBase<char> &OwnComment();
    /// For a record whose name, kind or polarity is about to change.
    inline void NoteChange() const;

    Basis::StringBase<char> name;
    std::atomic<unsigned int> owners{1};
    signed char objectType = 0; ///< an ObjectType
    Content const content;
};

/// The record of an object that is no pin and has a comment.
struct Object::CommentRecord : Object::Record {
    /// Of an object that gets its first comment, or becomes more than an object with one.
    explicit CommentRecord(Record const &model, Content recordContent = COMMENT)
        : Record(recordContent), comment(model.GetComment()) {
        objectType = model.objectType;
    }
    CommentRecord(CommentRecord const &) = default;

    Basis::StringBase<char> comment;
};

/// The record of a netlist that is found by its name, which is a model's.
struct Object::NetlistRecord : Object::CommentRecord {
    NetlistRecord(Record const &model, unsigned long &counter)
        : CommentRecord(model, NETLIST), renames(counter) {}
    NetlistRecord(NetlistRecord const &) = default;

    unsigned long &renames; ///< counts changes of names, and outlives the netlist
};

/// The record of a pin.
struct Object::PinRecord : Object::Record {
    explicit PinRecord(Polarity::Value pinPolarity) : Record(PIN), polarity(pinPolarity) {
        objectType = OBJECT_PIN;
    }
    PinRecord(PinRecord const &) = default;

    Polarity::Value polarity;
    PinFamilyPtr family; ///< none for a pin that no component made
    BitVectorValue defaultValue;
    Basis::StringBase<char> comment;
};

inline Basis::StringBase<char> const &Object::Record::GetComment() const {
    static Basis::StringBase<char> const none;
    return content == NAME ? none : const_cast<Record *>(this)->OwnComment();
}

inline Basis::StringBase<char> &Object::Record::OwnComment() {
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
