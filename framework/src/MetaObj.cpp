#include "framework/MetaObj.h"

#include <limits>
#include <memory>
#include <new>
#include <stdexcept>
#include <type_traits>
#include <utility>

#include <boost/make_shared.hpp>

namespace MetaObj {

namespace {

constexpr std::size_t kTypicalFieldCount = 8;

}  // namespace

const char* MetaTypeName(int type) {
    switch (type) {
        case META_BOOL:
            return "bool";
        case META_INT:
            return "int";
        case META_STRING:
            return "string";
        case META_STRUCT:
            return "struct";
        case META_LIST:
            return "list";
    }
    return "unknown";
}

MetaObject::~MetaObject() = default;

boost::shared_ptr<MetaString> MetaString::New() {
    return boost::make_shared<MetaString>(Token());
}

boost::shared_ptr<MetaString> MetaString::New(const std::string& value) {
    boost::shared_ptr<MetaString> s = boost::make_shared<MetaString>(Token());
    s->value_ = value;
    s->hasValue_ = true;
    return s;
}

boost::shared_ptr<MetaString> MetaString::New(std::string&& value) {
    boost::shared_ptr<MetaString> s = boost::make_shared<MetaString>(Token());
    s->value_ = std::move(value);
    s->hasValue_ = true;
    return s;
}

boost::shared_ptr<MetaInt> MetaInt::New() {
    return boost::make_shared<MetaInt>(Token());
}

boost::shared_ptr<MetaInt> MetaInt::New(std::int64_t value) {
    boost::shared_ptr<MetaInt> i = boost::make_shared<MetaInt>(Token());
    i->bits_ = static_cast<std::uint64_t>(value);
    i->hasValue_ = true;
    return i;
}

boost::shared_ptr<MetaInt> MetaInt::NewUnsigned(std::uint64_t value) {
    boost::shared_ptr<MetaInt> i = boost::make_shared<MetaInt>(Token());
    i->bits_ = value;
    i->isUnsigned_ = value > static_cast<std::uint64_t>(std::numeric_limits<std::int64_t>::max());
    i->hasValue_ = true;
    return i;
}

std::string MetaInt::ToString() const {
    return isUnsigned_ ? std::to_string(bits_) : std::to_string(static_cast<std::int64_t>(bits_));
}

boost::shared_ptr<MetaBool> MetaBool::New() {
    return boost::make_shared<MetaBool>(Token());
}

boost::shared_ptr<MetaBool> MetaBool::New(bool value) {
    boost::shared_ptr<MetaBool> b = boost::make_shared<MetaBool>(Token());
    b->value_ = value;
    b->hasValue_ = true;
    return b;
}

boost::shared_ptr<MetaStruct> MetaStruct::New(const std::string& typeName) {
    return boost::make_shared<MetaStruct>(Token(), typeName);
}

struct MetaStruct::StringBlock {
    using Slot = std::aligned_storage_t<sizeof(MetaString), alignof(MetaString)>;

    explicit StringBlock(std::size_t size) : slots(new Slot[size]), capacity(size) {}
    ~StringBlock() {
        for (std::size_t i = count; i-- > 0;) reinterpret_cast<MetaString*>(&slots[i])->~MetaString();
    }
    StringBlock(const StringBlock&) = delete;
    StringBlock& operator=(const StringBlock&) = delete;

    std::unique_ptr<Slot[]> slots;
    std::size_t capacity;
    std::size_t count = 0;
};

boost::shared_ptr<MetaStruct> MetaStruct::New(const std::string& typeName, std::size_t fieldCount) {
    boost::shared_ptr<MetaStruct> record = boost::make_shared<MetaStruct>(Token(), typeName);
    record->fields_.reserve(fieldCount);
    if (fieldCount > 0) record->strings_ = boost::make_shared<StringBlock>(fieldCount);
    return record;
}

MetaObjectPtr MetaStruct::NewString(std::string&& value) {
    if (!strings_ || strings_->count == strings_->capacity) return MetaString::New(std::move(value));
    auto* string = new (&strings_->slots[strings_->count]) MetaString(Token(), std::move(value));
    ++strings_->count;
    // Shares the block's ownership while pointing at the string in it.
    return MetaObjectPtr(strings_, string);
}

void MetaStruct::Put(const std::string& name, MetaObjectPtr&& value) {
    for (auto& field : fields_) {
        if (field.first == name) {
            field.second = std::move(value);
            return;
        }
    }
    // Room for a typical record at once, instead of growing one field at a
    // time: listings make thousands of records.
    if (fields_.capacity() == 0) fields_.reserve(kTypicalFieldCount);
    fields_.emplace_back(name, std::move(value));
}

void MetaStruct::SetField(const std::string& name, const MetaObjectPtr& value) {
    SetField(name, MetaObjectPtr(value));
}

void MetaStruct::SetField(const std::string& name, MetaObjectPtr&& value) {
    if (!value) {
        throw std::invalid_argument("MetaStruct::SetField: null value for field '" + name + "'");
    }
    Put(name, std::move(value));
}

void MetaStruct::SetField(const std::string& name, const std::string& value) {
    Put(name, NewString(std::string(value)));
}
void MetaStruct::SetField(const std::string& name, std::string&& value) {
    Put(name, NewString(std::move(value)));
}
void MetaStruct::SetField(const std::string& name, const char* value) {
    Put(name, NewString(value ? value : ""));
}
void MetaStruct::SetField(const std::string& name, bool value) {
    Put(name, MetaBool::New(value));
}
void MetaStruct::SetField(const std::string& name, int value) {
    Put(name, MetaInt::New(value));
}
void MetaStruct::SetField(const std::string& name, long value) {
    Put(name, MetaInt::New(value));
}
void MetaStruct::SetField(const std::string& name, long long value) {
    Put(name, MetaInt::New(value));
}
void MetaStruct::SetField(const std::string& name, unsigned int value) {
    Put(name, MetaInt::NewUnsigned(value));
}
void MetaStruct::SetField(const std::string& name, unsigned long value) {
    Put(name, MetaInt::NewUnsigned(value));
}
void MetaStruct::SetField(const std::string& name, unsigned long long value) {
    Put(name, MetaInt::NewUnsigned(value));
}
void MetaStruct::SetField(const std::string& name, const std::vector<std::string>& values) {
    SetField(name, std::vector<std::string>(values));
}
void MetaStruct::SetField(const std::string& name, std::vector<std::string>&& values) {
    boost::shared_ptr<MetaList> list = MetaList::New(META_STRING);
    list->Reserve(values.size());
    for (auto& v : values) list->Append(std::move(v));
    Put(name, std::move(list));
}

MetaObjectPtr MetaStruct::GetField(const std::string& name) const {
    for (const auto& field : fields_) {
        if (field.first == name) return field.second;
    }
    return MetaObjectPtr();
}

boost::shared_ptr<MetaList> MetaList::New(int elementType, const MetaObjectPtr& elementTemplate) {
    if (elementType != META_STRING && elementType != META_STRUCT) {
        throw std::invalid_argument("MetaList::New: a list holds strings (2) or records (3), not type " +
                                    std::to_string(elementType));
    }
    return boost::make_shared<MetaList>(Token(), elementType, elementTemplate);
}

void MetaList::Append(const boost::shared_ptr<MetaString>& element) {
    if (elementType_ != META_STRING || !element) {
        throw std::invalid_argument("MetaList::Append: a string does not belong in this list");
    }
    elements_.push_back(element);
}

void MetaList::Append(const boost::shared_ptr<MetaStruct>& element) {
    Append(boost::shared_ptr<MetaStruct>(element));
}

void MetaList::Append(boost::shared_ptr<MetaStruct>&& element) {
    if (elementType_ != META_STRUCT || !element) {
        throw std::invalid_argument("MetaList::Append: a record does not belong in this list");
    }
    elements_.push_back(std::move(element));
}

void MetaList::Append(const char* element) {
    Append(MetaString::New(element ? element : ""));
}

void MetaList::Append(const std::string& element) {
    Append(MetaString::New(element));
}

void MetaList::Append(std::string&& element) {
    Append(MetaString::New(std::move(element)));
}

}  // namespace MetaObj
