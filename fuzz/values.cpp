// Values of constants and of attributes: every text can be set, and what is then told is a value
// that tells itself again.

#include <memory>

#include "fuzz/Fuzz.h"
#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    std::string const text = TextOf(data, size);

    BitVectorValue value;
    value.SetValue(text.c_str());
    BitVectorValue const copy(value);
    value.SetValue("4:b:1010");
    value = copy;
    FUZZ_EXPECT(value.GetValue() == copy.GetValue() && value.GetLength() == copy.GetLength() &&
                    value.GetBase() == copy.GetBase(),
                "copy");
    FUZZ_EXPECT(text.find(value.GetValue().GetText()) != std::string::npos, "%s",
                value.GetValue().GetText());

    AttributeFactory const &factory = AttributeFactory::GetInstance();
    for (char const *const type :
         {"String", "Integer", "Float", "Boolean", "Bit", "BitVector", "User"}) {
        std::unique_ptr<Attribute> const attribute(
            factory.CreateAttribute(type, "name", text.c_str()));
        FUZZ_EXPECT(attribute != nullptr, "%s", type);
        std::string const told(attribute->GetValueString());
        std::unique_ptr<Attribute> const clone(attribute->CloneAttribute());
        // The width and precision of a float stay behind, as the copy of its class tells; and what
        // it tells depends on how long the text was.
        if (dynamic_cast<AttributeFloat *>(clone.get()))
            continue;
        FUZZ_EXPECT(*clone == *attribute, "clone of %s", type);
        attribute->SetValue("0");
        attribute->SetValue(told.c_str());
        FUZZ_EXPECT(std::string(attribute->GetValueString()) == told, "%s: %s", type, told.c_str());
    }
    return 0;
}
