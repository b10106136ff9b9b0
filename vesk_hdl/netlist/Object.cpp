#include "vesk_hdl/netlist/Object.h"

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/ObjectRecord.h"
#include "vesk_hdl/text/basis/Counting.h"
#include "vesk_hdl/text/basis/Functions.h"

namespace Vesk_Hdl {

using Basis::StringBase;

Object::Object() : record(new Record) {}

Object::Object(Object const &other) : record(other.record) {
    Basis::Counting::Join(record->owners);
}

Object::~Object() { Release(); }

void Object::Release() {
    if (Basis::Counting::Leave(record->owners))
        delete record;
}

/// The record for writing: this object's alone.
Object::Record &Object::Own() {
    if (record->owners.load(std::memory_order_acquire) != 1) {
        auto *const copy = new Record(*record);
        Release();
        record = copy;
    }
    return *record;
}

/// What makes a pin a pin stays behind; where that is alike, all the rest can be shared.
Object &Object::operator=(Object const &other) {
    if (record == other.record)
        return *this;
    if (record->IsSamePin(*other.record)) {
        Share(other);
        return *this;
    }
    Record &own = Own();
    own.name = other.record->name;
    own.objectType = other.record->objectType;
    if (HasComment() || other.HasComment())
        own.OwnRare().comment = other.record->GetComment();
    return *this;
}

/// Takes over everything.
void Object::Share(Object const &other) {
    Basis::Counting::Join(other.record->owners);
    Release();
    record = other.record;
}

bool Object::operator==(Object const &other) const {
    return record->GetComment() == other.record->GetComment() &&
           record->name == other.record->name && record->objectType == other.record->objectType;
}

void Object::SetName(char const *name) { SetNormalizedName(name); }

StringBase<char> Object::GetName() const { return record->name; }
StringBase<char> const &Object::GetNameRef() const { return record->name; }
StringBase<char> Object::GetComment() const { return record->GetComment(); }
bool Object::HasComment() const { return record->rare && !record->rare->comment.IsEmpty(); }

void Object::AddComment(char const *text) {
    StringBase<char> &comment = Own().OwnRare().comment;
    comment += text;
    comment += '\n';
}

bool Object::IsNamed(char const *name) const { return Basis::stricmp(record->name, name) == 0; }

void Object::NormalizeName(StringBase<char> &name) { Names::Normalize(name); }

StringBase<char> Object::GetBaseName(char const *name) {
    Names::Key const key(name);
    return StringBase<char>(Names::BaseName(key.View()));
}

bool Object::IsValidBaseName(char const *name) { return name && Names::IsBaseName(name); }

bool Object::IsValidIntegerString(StringBase<char> const &text) {
    return Names::IsInteger(text.View());
}

Object::ObjectType Object::GetStoredObjectType() const {
    return static_cast<ObjectType>(record->objectType);
}

void Object::SetObjectType(ObjectType type) { Own().objectType = static_cast<short>(type); }

void Object::SetNameText(StringBase<char> const &name) { Own().name = name; }

void Object::SetNormalizedName(char const *name) {
    StringBase<char> text(name);
    Names::Normalize(text);
    Own().name = std::move(text);
}

ObjectVisitor::~ObjectVisitor() = default;

} // namespace Vesk_Hdl
