// The fields of tables and queries.
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "host/access/AccessProject.h"
#include "host/access/CN_IDEAccFormProcessor.h"
#include "host/access/LateBound.h"
#include "host/access/ServerClientDatabase.h"
#include "host/access/clsAccField.h"
#include "host/server/CTovimarServerData.h"
#include "platform/text/Text.h"

namespace tovimar {
namespace {

/// Moves on by one with each field.
class FieldProgress {
public:
    FieldProgress(const std::string& typeName, const std::string& objectName, std::int32_t maximum)
        : start_("Processing field of " + text::ToLower(typeName) + " [" + objectName + "]."),
          maximum_(maximum) {}
    ~FieldProgress() {
        if (CTovimarServerData* data = Session::ServerData(); data != nullptr && position_ > 0)
            PassOver([data] { data->ProgressBarDispose(); });
    }
    FieldProgress(const FieldProgress&) = delete;
    FieldProgress& operator=(const FieldProgress&) = delete;

    void Show(const std::string& fieldName) {
        CTovimarServerData* data = Session::ServerData();
        if (data == nullptr)
            return;
        const std::string message = start_ + fieldName + "...";
        if (position_ == 0)
            data->ProgressBarInit(message, maximum_);
        data->ProgressBarUpdate(message, ++position_);
    }

private:
    std::string start_;
    std::int32_t maximum_;
    std::int32_t position_ = 0;
};

CControlsCollection LocalFields(const HostObject& app, const char* definitions, const std::string& name,
                                const std::string& typeName) {
    CControlsCollection list;
    const HostObject definition = late::Object(late::Object(app, "CurrentDb"), definitions, {name});
    const HostObject fields = late::Object(definition, "Fields");
    FieldProgress progress(typeName, name, late::Count(fields));
    late::ForEach(fields, [&](const HostObject& field) {
        const std::string fieldName = late::Text(field, "Name");
        progress.Show(fieldName);
        list.Add(std::make_shared<clsAccField>(name, fieldName,
                                               late::PropertyOrNull(field, "Description").AsString(),
                                               late::IntegerOrZero(field, "OrdinalPosition")));
    });
    return list;
}

CControlsCollection ServerTableFields(const HostObject& app, const std::string& table) {
    CControlsCollection list;
    const std::vector<std::string> columns = server_client::ColumnNames(app, table);
    FieldProgress progress("Table", table, static_cast<std::int32_t>(columns.size()));
    std::int32_t position = 0;
    for (const std::string& column : columns) {
        progress.Show(column);
        std::string description;
        PassOver([&] { description = server_client::ColumnDescription(app, table, column); });
        list.Add(std::make_shared<clsAccField>(table, column, description, position++));
    }
    return list;
}

} // namespace

CControlsCollection CN_IDEAccFormProcessor::FieldsCollectionGet(const std::string& vstrObjName,
                                                                const std::string& vstrObjectTypeName) {
    CControlsCollection fields;
    Trapped("CN_IDEAccFormProcessor", "IClientFormProcessor_FieldsCollectionGet", [&] {
        const bool serverClient = access_project::IsADPorADE(application_);
        if (text::EqualsIgnoringCase(vstrObjectTypeName, "Table"))
            fields = serverClient ? ServerTableFields(application_, vstrObjName)
                                  : LocalFields(application_, "TableDefs", vstrObjName, vstrObjectTypeName);
        else if (text::EqualsIgnoringCase(vstrObjectTypeName, "Query") && !serverClient)
            fields = LocalFields(application_, "QueryDefs", vstrObjName, vstrObjectTypeName);
    });
    return fields;
}

} // namespace tovimar
