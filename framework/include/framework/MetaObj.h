// Result values of commands: scalars, records and lists, all held by
// boost::shared_ptr. A command builds one value; every formatter renders it.
#pragma once

#include <cstdint>
#include <string>
#include <utility>
#include <vector>

#include <boost/enable_shared_from_this.hpp>
#include <boost/shared_ptr.hpp>

#include "framework/Export.h"

namespace MetaObj {

// The kind of a value. The numbers of string (2) and struct (3) are the ones
// commands pass to MetaList::New to say what a list holds.
enum MetaType {
    META_BOOL = 0,
    META_INT = 1,
    META_STRING = 2,
    META_STRUCT = 3,
    META_LIST = 4,
};

AUTOCLI_EXPORT const char* MetaTypeName(int type);

class AUTOCLI_EXPORT MetaObject : public boost::enable_shared_from_this<MetaObject> {
public:
    virtual ~MetaObject();
    virtual MetaType GetType() const = 0;

    // A scalar made by New() without argument is a template: it describes the
    // shape of an output and holds no value. Records and lists always "have"
    // a value.
    virtual bool HasValue() const { return true; }

protected:
    // Only the classes' own New() can make the token their constructors
    // take; the constructors are public for boost::make_shared alone, which
    // puts a value and its reference count in one allocation.
    struct Token {
        explicit Token() = default;
    };

    MetaObject() = default;
    MetaObject(const MetaObject&) = delete;
    MetaObject& operator=(const MetaObject&) = delete;
};

using MetaObjectPtr = boost::shared_ptr<MetaObject>;

class AUTOCLI_EXPORT MetaString : public MetaObject {
public:
    explicit MetaString(Token) {}
    MetaString(Token, std::string&& value) : value_(std::move(value)), hasValue_(true) {}
    static boost::shared_ptr<MetaString> New();
    static boost::shared_ptr<MetaString> New(const std::string& value);
    static boost::shared_ptr<MetaString> New(std::string&& value);

    MetaType GetType() const override { return META_STRING; }
    bool HasValue() const override { return hasValue_; }
    const std::string& GetValue() const { return value_; }

private:
    std::string value_;
    bool hasValue_ = false;
};

// A 64-bit integer. Unsigned counters above the signed range are kept as
// unsigned so that they print exactly instead of wrapping to negatives.
class AUTOCLI_EXPORT MetaInt : public MetaObject {
public:
    explicit MetaInt(Token) {}
    static boost::shared_ptr<MetaInt> New();
    static boost::shared_ptr<MetaInt> New(std::int64_t value);
    static boost::shared_ptr<MetaInt> NewUnsigned(std::uint64_t value);

    MetaType GetType() const override { return META_INT; }
    bool HasValue() const override { return hasValue_; }
    bool IsUnsigned() const { return isUnsigned_; }
    std::int64_t GetValue() const { return static_cast<std::int64_t>(bits_); }
    std::uint64_t GetUnsignedValue() const { return bits_; }
    std::string ToString() const;

private:
    std::uint64_t bits_ = 0;
    bool isUnsigned_ = false;
    bool hasValue_ = false;
};

class AUTOCLI_EXPORT MetaBool : public MetaObject {
public:
    explicit MetaBool(Token) {}
    static boost::shared_ptr<MetaBool> New();
    static boost::shared_ptr<MetaBool> New(bool value);

    MetaType GetType() const override { return META_BOOL; }
    bool HasValue() const override { return hasValue_; }
    bool GetValue() const { return value_; }

private:
    bool value_ = false;
    bool hasValue_ = false;
};

// A record of a named type with named fields. Fields keep the order in which
// they were first set; setting a field again replaces its value in place.
class AUTOCLI_EXPORT MetaStruct : public MetaObject {
public:
    using Field = std::pair<std::string, MetaObjectPtr>;

    static boost::shared_ptr<MetaStruct> New(const std::string& typeName);
    // The same, with room for exactly `fieldCount` fields: a listing that
    // makes thousands of records of a known shape wastes none.
    static boost::shared_ptr<MetaStruct> New(const std::string& typeName, std::size_t fieldCount);
    MetaStruct(Token, const std::string& typeName) : typeName_(typeName) {}

    MetaType GetType() const override { return META_STRUCT; }
    const std::string& GetTypeName() const { return typeName_; }

    void SetField(const std::string& name, const MetaObjectPtr& value);
    void SetField(const std::string& name, MetaObjectPtr&& value);
    void SetField(const std::string& name, const std::string& value);
    void SetField(const std::string& name, std::string&& value);
    void SetField(const std::string& name, const char* value);
    void SetField(const std::string& name, bool value);
    void SetField(const std::string& name, int value);
    void SetField(const std::string& name, long value);
    void SetField(const std::string& name, long long value);
    void SetField(const std::string& name, unsigned int value);
    void SetField(const std::string& name, unsigned long value);
    void SetField(const std::string& name, unsigned long long value);
    void SetField(const std::string& name, const std::vector<std::string>& values);
    void SetField(const std::string& name, std::vector<std::string>&& values);

    // Null when the field was never set.
    MetaObjectPtr GetField(const std::string& name) const;
    const std::vector<Field>& GetFields() const { return fields_; }

private:
    // Sets a field to a value known not to be null.
    void Put(const std::string& name, MetaObjectPtr&& value);
    // A string value for a field: in the record's block while it has room,
    // else one of its own.
    MetaObjectPtr NewString(std::string&& value);

    // The strings of a record made with a field count live side by side in
    // one block, which the fields pointing into it keep alive, instead of
    // being allocated one by one.
    struct StringBlock;

    std::string typeName_;
    std::vector<Field> fields_;
    boost::shared_ptr<StringBlock> strings_;
};

// A list of strings (META_STRING) or of records (META_STRUCT). The element
// template of a record list names the record type, so an empty list still
// tells a formatter which columns it would have had.
class AUTOCLI_EXPORT MetaList : public MetaObject {
public:
    static boost::shared_ptr<MetaList> New(int elementType, const MetaObjectPtr& elementTemplate = MetaObjectPtr());

    MetaList(Token, int elementType, const MetaObjectPtr& elementTemplate)
        : elementType_(elementType), elementTemplate_(elementTemplate) {}

    MetaType GetType() const override { return META_LIST; }
    int GetElementType() const { return elementType_; }
    const MetaObjectPtr& GetElementTemplate() const { return elementTemplate_; }

    // Each Append checks that the element matches the list's element type
    // and throws std::invalid_argument otherwise.
    void Append(const boost::shared_ptr<MetaString>& element);
    void Append(const boost::shared_ptr<MetaStruct>& element);
    void Append(boost::shared_ptr<MetaStruct>&& element);
    void Append(const char* element);
    void Append(const std::string& element);
    void Append(std::string&& element);

    // Makes room for `count` elements in all, for a caller that knows how
    // many it will append.
    void Reserve(std::size_t count) { elements_.reserve(count); }

    const std::vector<MetaObjectPtr>& GetElements() const { return elements_; }
    std::size_t Size() const { return elements_.size(); }

private:
    int elementType_;
    MetaObjectPtr elementTemplate_;
    std::vector<MetaObjectPtr> elements_;
};

}  // namespace MetaObj
