#include "host/access/ServerClientDatabase.h"

#include "foundation/ErrorTrap.h"
#include "host/access/LateBound.h"
#include "platform/text/Text.h"

namespace tovimar::server_client {
namespace {

/// An open connection to the project's server, closed at the end.
class Connection {
public:
    explicit Connection(const HostObject& app)
        : connection_(late::Call(app, "CreateObject", {Value("ADODB.Connection")}).AsObject()) {
        const HostObject current = late::Object(late::Object(app, "CurrentProject"), "Connection");
        late::Call(connection_, "Open", {late::Get(current, "ConnectionString")});
    }
    ~Connection() {
        PassOver([this] { late::Call(connection_, "Close"); });
    }
    Connection(const Connection&) = delete;
    Connection& operator=(const Connection&) = delete;

    const HostObject& Object() const { return connection_; }

private:
    HostObject connection_;
};

std::string InQuotes(const std::string& name) {
    return "'" + text::ReplaceAll(name, "'", "''") + "'";
}

std::string DescriptionOf(const HostObject& app, const std::string& tableAndTail) {
    const Connection connection(app);
    const std::string statement =
        "SELECT * FROM ::fn_listextendedproperty (null, 'user', 'dbo', 'table', " + tableAndTail + ")";
    const HostObject rows = late::Call(connection.Object(), "Execute", {statement}).AsObject();
    while (!late::Flag(rows, "EOF")) {
        const auto field = [&rows](const char* name) {
            return late::Text(late::Object(rows, "Fields", {Value(name)}), "Value");
        };
        if (text::EqualsIgnoringCase(field("name"), "MS_Description"))
            return field("value");
        late::Call(rows, "MoveNext");
    }
    return {};
}

} // namespace

std::string TableDescription(const HostObject& app, const std::string& table) {
    return DescriptionOf(app, InQuotes(table) + ", default, default");
}

std::string ColumnDescription(const HostObject& app, const std::string& table, const std::string& column) {
    return DescriptionOf(app, InQuotes(table) + ", 'column', " + InQuotes(column));
}

std::vector<std::string> ColumnNames(const HostObject& app, const std::string& table) {
    const Connection connection(app);
    const HostObject catalog = late::Call(app, "CreateObject", {Value("ADOX.Catalog")}).AsObject();
    late::Set(catalog, "ActiveConnection", connection.Object());
    std::vector<std::string> names;
    late::ForEach(late::Object(late::Object(catalog, "Tables", {table}), "Columns"),
                  [&names](const HostObject& column) { names.push_back(late::Text(column, "Name")); });
    return names;
}

} // namespace tovimar::server_client
