#include "platform/access/database/Inspection.h"

#include "platform/Error.h"
#include "platform/access/ExportTreeText.h"
#include "platform/access/database/BlobTree.h"
#include "platform/access/database/DatabaseDesigns.h"
#include "platform/access/database/MemberList.h"
#include "platform/access/database/PropertyCodes.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <set>

namespace tovimar::platform::access {

namespace {

constexpr std::uint16_t kNameCode = 20;

std::string Shown(const PropertyValue& value) {
    constexpr std::string_view kDigits = "0123456789abcdef";
    constexpr std::size_t kShownBytes = 16;
    if (value.form == PropertyValue::Form::NotDefault)
        return "NotDefault";
    if (value.form != PropertyValue::Form::Bytes)
        return value.text;
    std::string shown = std::to_string(value.text.size()) + " bytes:";
    for (std::size_t i = 0; i < std::min(value.text.size(), kShownBytes); ++i) {
        const auto byte = static_cast<unsigned char>(value.text[i]);
        shown += {' ', kDigits[byte >> 4U], kDigits[byte & 15U]};
    }
    return shown + (value.text.size() > kShownBytes ? " ..." : "");
}

class DesignInspector {
public:
    explicit DesignInspector(Inspection& inspection) : inspection_(inspection) {}

    void Run(const DesignBlob& design) {
        inspection_.version = design.version;
        inspection_.root = Described(*design.root);
        if (!design.closed)
            Fault("the design ends before its lists of objects are full");
        if (design.unread > 0)
            Fault(std::to_string(design.unread) + " bytes follow behind the end of the design");
    }

    void Compare(const MemberList& list) {
        std::set<std::string> members;
        for (const auto& member : list.members)
            if (!member.isField)
                members.insert(text::FoldCase(member.name));
        for (const auto& name : members)
            if (!names_.contains(name))
                Fault("the member list names " + name + ", which isn't in the design");
        for (const auto& name : names_)
            if (!members.contains(name))
                Fault("the design holds " + name + ", which the member list doesn't name");
    }

    void Fault(const std::string& text) { inspection_.faults.push_back(text); }

private:
    InspectedObject Described(const BlobObject& object) {
        ++inspection_.objects;
        InspectedObject described;
        described.type = ObjectTypeName(object.type);
        for (const auto& record : object.records) {
            InspectedProperty property{RecordName(record), record.slot, record.code, IsKnown(record),
                                       Shown(RecordValue(record))};
            inspection_.unknown += property.isKnown ? 0 : 1;
            if (record.code == kNameCode && described.name.empty()) {
                described.name = property.value;
                names_.insert(text::FoldCase(property.value));
            }
            described.properties.push_back(std::move(property));
        }
        for (const auto& child : object.children)
            described.children.push_back(Described(*child));
        return described;
    }

    static bool IsKnown(const DesignRecord& record) {
        return record.code == 0 || IsKnownProperty(record.code);
    }

    Inspection& inspection_;
    std::set<std::string> names_;
};

void InspectDesign(DatabaseDesigns& designs, Inspection& inspection) {
    DesignInspector inspector(inspection);
    try {
        const auto blob = designs.Blob(inspection.kind, inspection.name);
        inspection.bytes = blob.size();
        auto design = ReadDesignBlob(blob);
        if (const auto delta = designs.Delta(inspection.kind, inspection.name); !delta.empty())
            MergeDelta(design, delta);
        inspector.Run(design);
        if (const auto members = designs.MemberBytes(inspection.kind, inspection.name); !members.empty())
            inspector.Compare(ReadMemberList(members, text::CodePage(designs.Code().codePage)));
    } catch (const RaisedError& failure) {
        inspector.Fault(failure.what());
    }
}

} // namespace

Inspection InspectObject(DatabaseDesigns& designs, ObjectKind kind, const std::string& name) {
    Inspection inspection;
    inspection.kind = kind;
    inspection.name = name;
    if (kind == ObjectKind::Form || kind == ObjectKind::Report) {
        InspectDesign(designs, inspection);
        return inspection;
    }
    try {
        if (kind == ObjectKind::Macro) {
            inspection.bytes = designs.Blob(kind, name).size();
            inspection.text = ExportTreeText(*designs.Tree(kind, name).root);
        } else {
            inspection.text = designs.ModuleCode(name).value_or("");
            inspection.bytes = inspection.text.size();
        }
    } catch (const RaisedError& failure) {
        inspection.faults.emplace_back(failure.what());
    }
    return inspection;
}

std::vector<Inspection> InspectAll(DatabaseDesigns& designs) {
    std::vector<Inspection> all;
    for (const auto kind : {ObjectKind::Form, ObjectKind::Report, ObjectKind::Macro, ObjectKind::Module})
        for (const auto& name : designs.Names(kind))
            all.push_back(InspectObject(designs, kind, name));
    return all;
}

} // namespace tovimar::platform::access
