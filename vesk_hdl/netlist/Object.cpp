// Objects and their records. Copies share a record until one of them changes: see
// docs/architecture.md, "Storage and its invariants".

#include "vesk_hdl/netlist/Object.h"

#include <cassert>
#include <utility>

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/storage/ObjectRecord.h"
#include "vesk_hdl/text/basis/Counting.h"
#include "vesk_hdl/text/basis/Functions.h"
#include "vesk_hdl/text/basis/OrEmpty.h"
#include "vesk_hdl/text/basis/StringEdit.h"

namespace Vesk_Hdl {

using Basis::StringBase;

namespace {

/// A rewritten copy of a name.
StringBase<char> NormalText(char const *name) {
    StringBase<char> text(name);
    Names::Normalize(text);
    return text;
}

} // namespace

/// The record of all objects without a name. It is never counted, changed or freed, so that an
/// object costs nothing until it gets a name.
Object::Record *Object::NoRecord() {
    static Record none;
    return &none;
}

/// A record of class `Made` in the block of its name. The arguments are those of its constructor: a
/// record to copy all but the name from, or initial values.
template <class Made, class... Model>
Object::Record *Object::MakeRecord(std::string_view name, Model &&...model) {
    void *room = nullptr;
    StringBase<char> text = Basis::StringEdit::MakeWithRoom(name, sizeof(Made), room);
    static_assert(alignof(Made) <= alignof(void *), "the room is aligned as a pointer is");
    auto *const made = new (room) Made(std::forward<Model>(model)...);
    made->name = std::move(text); // the record now owns the block that it is in, see Release
    return made;
}

void Object::Replace(Record *now) {
    Release();
    record = now;
}

/// Gives this object a record of its own with that name and otherwise the present contents.
void Object::Rename(std::string_view name) {
    switch (record->content) {
    case Record::NAME:
        return Replace(MakeRecord<Record>(name, std::as_const(*record)));
    case Record::COMMENT:
        return Replace(
            MakeRecord<CommentRecord>(name, static_cast<CommentRecord const &>(*record)));
    case Record::NETLIST:
        return Replace(
            MakeRecord<NetlistRecord>(name, static_cast<NetlistRecord const &>(*record)));
    case Record::PIN:
        return Replace(MakeRecord<PinRecord>(name, static_cast<PinRecord const &>(*record)));
    }
}

/// The record for changing anything but the name. A record that copies share is copied first.
Object::Record &Object::Own() {
    if (record == NoRecord() || record->owners.load(std::memory_order_acquire) != 1)
        Rename(record->name.View());
    return *record;
}

/// The comment for changing it. A record without room for one is replaced by one that has it.
StringBase<char> &Object::OwnComment() {
    if (record->content == Record::NAME)
        Replace(MakeRecord<CommentRecord>(record->name.View(), std::as_const(*record)));
    return Own().OwnComment();
}

void Object::CountRenames(unsigned long &counter) {
    Replace(MakeRecord<NetlistRecord>(record->name.View(), std::as_const(*record), counter));
}

void Object::BeginPin(char const *name, Polarity::Value polarity) {
    Names::NormalName const normal(name);
    Replace(MakeRecord<PinRecord>(normal.View(), polarity));
}

Object::PinRecord const &Object::GetPinRecord() const {
    assert(record->content == Record::PIN && "another object's record has no polarity");
    return static_cast<PinRecord const &>(*record);
}

Object::PinRecord &Object::OwnPinRecord() {
    assert(record->content == Record::PIN && "another object's record has no polarity");
    return static_cast<PinRecord &>(Own());
}

Object::Object() : record(NoRecord()) {}

Object::Object(Object const &other) : record(other.record) { Join(); }

Object::~Object() { Release(); }

void Object::Join() {
    if (record != NoRecord())
        Basis::Counting::Join(record->owners);
}

void Object::Release() {
    if (record == NoRecord() || !Basis::Counting::Leave(record->owners))
        return;
    // The record is in the block of its name, which is freed last, at the end of this function.
    StringBase<char> const block = std::move(record->name);
    switch (record->content) {
    case Record::NAME:
        return record->~Record();
    case Record::COMMENT:
        return static_cast<CommentRecord *>(record)->~CommentRecord();
    case Record::NETLIST:
        return static_cast<NetlistRecord *>(record)->~NetlistRecord();
    case Record::PIN:
        return static_cast<PinRecord *>(record)->~PinRecord();
    }
}

/// Assigns name, comment and kind, but not the polarity or default value of a pin, nor the counter
/// of a netlist. If neither object has these, the whole record is shared.
Object &Object::operator=(Object const &other) {
    if (record == other.record)
        return *this;
    record->NoteChange();
    if (record->content < Record::NETLIST && other.record->content < Record::NETLIST) {
        Share(other);
        return *this;
    }
    StringBase<char> const comment = other.GetComment();
    bool const hasComment = HasComment() || other.HasComment();
    Rename(other.record->name.View());
    record->objectType = other.record->objectType;
    if (hasComment)
        OwnComment() = comment;
    return *this;
}

void Object::Share(Object const &other) {
    if (record == other.record)
        return;
    record->NoteChange();
    Release();
    record = other.record;
    Join();
}

bool Object::operator==(Object const &other) const {
    return record->GetComment() == other.record->GetComment() &&
           record->name == other.record->name && record->objectType == other.record->objectType;
}

void Object::SetName(char const *name) { SetNormalizedName(name); }

StringBase<char> Object::GetName() const { return record->name; }
StringBase<char> const &Object::GetNameRef() const { return record->name; }
StringBase<char> Object::GetComment() const { return record->GetComment(); }
bool Object::HasComment() const { return !record->GetComment().IsEmpty(); }

void Object::AddComment(char const *text) {
    StringBase<char> line(text); // a copy: the text may be this object's name
    line += '\n';
    OwnComment() += line;
}

bool Object::IsNamed(char const *name) const { return Basis::stricmp(record->name, name) == 0; }

void Object::NormalizeName(StringBase<char> &name) { Names::Normalize(name); }

StringBase<char> Object::GetBaseName(char const *name) {
    Names::NormalName const whole(name);
    return StringBase<char>(Names::BaseName(whole.View()));
}

bool Object::IsValidBaseName(char const *name) { return name && Names::IsBaseName(name); }

bool Object::IsValidIntegerString(StringBase<char> const &text) {
    return Names::IsInteger(text.View());
}

Object::ObjectType Object::GetStoredObjectType() const {
    return static_cast<ObjectType>(record->objectType);
}

void Object::SetObjectType(ObjectType type) { Own().objectType = static_cast<signed char>(type); }

void Object::SetNameText(StringBase<char> const &name) {
    record->NoteChange();
    Rename(name.View());
}

void Object::SetNormalizedName(char const *name) {
    std::string_view const text = Basis::ViewOf(name);
    record->NoteChange();
    if (Names::IsNormal(text))
        Rename(text);
    else
        Rename(NormalText(name).View());
}

ObjectVisitor::~ObjectVisitor() = default;

} // namespace Vesk_Hdl
