#include "vesk_hdl/netlist/Object.h"

#include <utility>

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/ObjectRecord.h"
#include "vesk_hdl/text/basis/Counting.h"
#include "vesk_hdl/text/basis/Functions.h"
#include "vesk_hdl/text/basis/OrEmpty.h"

namespace Vesk_Hdl {

using Basis::StringBase;

namespace {

StringBase<char> NormalText(char const *name) {
    StringBase<char> text(name);
    Names::Normalize(text);
    return text;
}

} // namespace

/// That of all objects without a name. It is never counted or freed.
Object::Record *Object::NoRecord() {
    static Record none{};
    return &none;
}

/// A record with that name, all else as in `model`.
template <class Made>
Object::Record *Object::MakeRecord(std::string_view name, Record const &model) {
    void *room = nullptr;
    StringBase<char> text = StringBase<char>::MakeWithRoom(name, sizeof(Made), room);
    auto *const made = new (room) Made(model);
    made->name = std::move(text);
    return made;
}

void Object::Replace(Record *now) {
    Release();
    record = now;
}

void Object::Rename(std::string_view name) {
    Replace(record->isRare ? MakeRecord<RareRecord>(name, *record)
                           : MakeRecord<Record>(name, *record));
}

/// The record for writing anything but the name: this object's alone.
Object::Record &Object::Own() {
    if (record == NoRecord() || record->owners.load(std::memory_order_acquire) != 1)
        Rename(record->name.View());
    return *record;
}

Object::RareRecord &Object::OwnRare() {
    if (record->isRare)
        Own();
    else
        Replace(MakeRecord<RareRecord>(record->name.View(), *record));
    return *static_cast<RareRecord *>(record);
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
    StringBase<char> const block = std::move(record->name); // which the record stands in
    if (record->isRare)
        static_cast<RareRecord *>(record)->~RareRecord();
    else
        record->~Record();
}

/// What makes a pin a pin stays behind; where that is alike, all the rest can be shared.
Object &Object::operator=(Object const &other) {
    if (record == other.record)
        return *this;
    record->NoteChange();
    if (record->IsSamePin(*other.record)) {
        Share(other);
        return *this;
    }
    bool const hasComment = HasComment() || other.HasComment();
    Rename(other.record->name.View());
    record->objectType = other.record->objectType;
    if (hasComment)
        OwnRare().comment = other.record->GetComment();
    return *this;
}

/// Takes over everything.
void Object::Share(Object const &other) {
    if (record == other.record)
        return;
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
    StringBase<char> line(text); // the text may be this object's name
    line += '\n';
    OwnRare().comment += line;
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
