#include "db/ConnectionTarget.h"

#include "common/Failure.h"

#include <QDir>
#include <QStringList>

#include <algorithm>
#include <vector>

namespace pelmar {

namespace {

enum class Field { Server, User, Password, Database, None };

struct Piece {
    const char16_t* marker;
    Field field;
};

struct Layout {
    std::vector<Piece> pieces;
    bool integrated;
    bool dataSource = false;
};

// The layouts of the five kinds, marker by marker, in the order BuildConnString writes them.
const std::vector<Layout>& layouts()
{
    static const std::vector<Layout> all = {
        {{{u"Provider=sqloledb;Data Source=", Field::Server},
          {u";User Id=", Field::User},
          {u";Password=", Field::Password},
          {u";Initial Catalog=", Field::Database}},
         false},
        {{{u"Provider=sqloledb;Data Source=", Field::Server},
          {u";Integrated Security=SSPI;Persist Security Info=False;Initial Catalog=", Field::Database}},
         true},
        {{{u"Provider=SQLNCLI;Server=", Field::Server},
          {u";UID=", Field::User},
          {u";PWD=", Field::Password},
          {u";Database=", Field::Database}},
         false},
        {{{u"Provider=SQLNCLI;Server=", Field::Server}, {u";Trusted_Connection=yes;Database=", Field::Database}}, true},
        {{{u"DSN=", Field::Server}, {u";Uid=", Field::User}, {u";Pwd=", Field::Password}}, false, true},
    };
    return all;
}

void assign(ConnectionTarget& target, Field field, const QString& value)
{
    switch (field) {
    case Field::Server: target.host = value; break;
    case Field::User: target.user = value; break;
    case Field::Password: target.password = value; break;
    case Field::Database: target.database = value; break;
    case Field::None: break;
    }
}

// Cuts the string along the layout's markers. The values are unquoted, so a password may hold
// a later marker's text: its end is searched from the right, every other value's from the left.
bool cut(const QString& text, const Layout& layout, ConnectionTarget& target)
{
    const auto& pieces = layout.pieces;
    if (!text.startsWith(QString::fromUtf16(pieces.front().marker)))
        return false;
    qsizetype pos = QString::fromUtf16(pieces.front().marker).size();
    for (size_t i = 0; i < pieces.size(); ++i) {
        qsizetype end = text.size();
        if (i + 1 < pieces.size()) {
            const QString next = QString::fromUtf16(pieces[i + 1].marker);
            end = pieces[i].field == Field::Password ? text.lastIndexOf(next) : text.indexOf(next, pos);
            if (end < pos)
                return false;
            assign(target, pieces[i].field, text.mid(pos, end - pos));
            pos = end + next.size();
        } else {
            assign(target, pieces[i].field, text.mid(pos));
        }
    }
    target.integrated = layout.integrated;
    return true;
}

void splitPort(ConnectionTarget& target)
{
    const qsizetype comma = target.host.lastIndexOf(u',');
    if (comma < 0)
        return;
    bool ok = false;
    const int port = target.host.mid(comma + 1).trimmed().toInt(&ok);
    if (ok) {
        target.port = port;
        target.host = target.host.left(comma).trimmed();
    }
}

bool isPostgreSql(const QString& driver)
{
    return driver.contains(QStringLiteral("PostgreSQL"), Qt::CaseInsensitive);
}

bool isFreeTds(const QString& driver)
{
    return driver.contains(QStringLiteral("TDS"), Qt::CaseInsensitive);
}

}  // namespace

QString odbcQuoted(const QString& value)
{
    static const QString special = QStringLiteral(";{}=");
    const bool plain = std::none_of(value.begin(), value.end(), [](QChar c) { return special.contains(c); })
        && value.trimmed() == value;
    if (plain)
        return value;
    QString quoted = value;
    quoted.replace(u'}', QStringLiteral("}}"));
    return u'{' + quoted + u'}';
}

ConnectionTarget ConnectionTarget::parse(const QString& connString)
{
    for (const Layout& layout : layouts()) {
        ConnectionTarget target;
        if (!cut(connString, layout, target))
            continue;
        if (layout.dataSource) {
            target.kind = Kind::DataSourceName;
            return target;
        }
        if (target.host.startsWith(QStringLiteral("sqlite:"))) {
            target.kind = Kind::Embedded;
            target.folder = target.host.mid(7);
            return target;
        }
        splitPort(target);
        return target;
    }
    throw Failure(QStringLiteral("The connection string is not of a kind this program can open."));
}

QString ConnectionTarget::embeddedFile() const
{
    return QDir(folder).filePath(database + QStringLiteral(".sqlite"));
}

QString ConnectionTarget::odbcString(const QString& driver) const
{
    QStringList parts;
    if (kind == Kind::DataSourceName) {
        parts << QStringLiteral("DSN=") + odbcQuoted(host);
        if (!user.isEmpty())
            parts << QStringLiteral("UID=") + odbcQuoted(user) << QStringLiteral("PWD=") + odbcQuoted(password);
        return parts.join(u';');
    }
    // The driver manager itself reads the braced driver name.
    parts << QStringLiteral("DRIVER={") + driver + u'}';
    if (isPostgreSql(driver) || isFreeTds(driver)) {
        parts << QStringLiteral("SERVER=") + odbcQuoted(host);
        if (port != 0)
            parts << QStringLiteral("PORT=%1").arg(port);
    } else {
        parts << QStringLiteral("SERVER=") + odbcQuoted(port != 0 ? QStringLiteral("%1,%2").arg(host).arg(port) : host);
    }
    parts << QStringLiteral("DATABASE=") + odbcQuoted(database);
    if (integrated)
        parts << QStringLiteral("Trusted_Connection=yes");
    else
        parts << QStringLiteral("UID=") + odbcQuoted(user) << QStringLiteral("PWD=") + odbcQuoted(password);
    if (isFreeTds(driver))
        parts << QStringLiteral("TDS_Version=7.4") << QStringLiteral("ClientCharset=UTF-8");
    if (isPostgreSql(driver))
        // Rows are fetched in batches instead of the whole result at once, so that memory stays
        // flat however many recipients a statement returns.
        parts << QStringLiteral("UseDeclareFetch=1") << QStringLiteral("Fetch=1000");
    return parts.join(u';');
}

}  // namespace pelmar
