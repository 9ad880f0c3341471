// Compares the tables of the protocol's page, from which peers are written, with the tables in the program.
#include "messaging/services/ServiceFamilies.h"
#include "messaging/services/ServiceTable.h"

#include <QFile>
#include <QMap>
#include <QRegularExpression>
#include <QTest>

namespace
{

using Records = QMap<QString, QStringList>; // fields by record

// "client id" of clientId.
QString words(const QString& name)
{
    static const QRegularExpression capital("([A-Z])");
    return QString(name).replace(capital, " \\1").toLower();
}

QString field(const QString& name, const QString& kind)
{
    return words(name) + " (" + kind + ")";
}

template <typename Form>
QString kindOf(Form)
{
    return Form::KIND;
}
template <typename Form, int COUNT>
QString kindOf(WireForms::Several<Form, COUNT>)
{
    static const QMap<int, QString> counts{{3, "three "}, {4, "four "}, {7, "seven "}};
    return counts.value(COUNT) + Form::KIND;
}

QString kindOfValue(int)
{
    return "int";
}
QString kindOfValue(bool)
{
    return "bool as int";
}
QString kindOfValue(const std::wstring&)
{
    return "wide";
}

// Returns what the page must say, from the program's tables.
class ServiceRows
{
public:
    ServiceRows()
    {
        addService<IAPPEventFilter>();
        addService<IFileManagerController>();
        addService<IMessageCenter>();
        addService<IPowerManager>();
        addService<IProjectDataManager>();
        addService<IShowTitlerController>();
        addService<ISoftKeyBoardController>();
        addService<ISystemSetupManager>();
        addRows<ITitler>("ITitler");
        addRows<ITitlerCallBack>("ITitlerCallBack");
        addRows<IAPPEventFilterCallBack>("APPEventFilter answers");
        addRows<IAPPEventFilterNotify>("APPEventFilter events");
        addRows<IFileManagerControllerCallBack>("FileManagerController answers");
        addRows<IFileManagerControllerNotify>("FileManagerController events");
        addRows<IMessageCenterCallBack>("MessageCenter answers");
        addRows<IMessageCenterNotify>("MessageCenter events");
        addRows<IPowerManagerCallBack>("PowerManager answers");
        addRows<IPowerManagerNotify>("PowerManager events");
        addRows<IProjectDataManagerCallBack>("ProjectDataManager answers");
        addRows<IProjectDataManagerNotify>("ProjectDataManager events");
        addRows<IShowTitlerControllerCallBack>("ShowTitlerController answers");
        addRows<ISoftKeyBoardControllerCallBack>("SoftKeyBoardController answers");
        addRows<ISystemSetupManagerCallBack>("SystemSetupManager answers");
        addRows<ISystemSetupManagerNotify>("SystemSetupManager events");
    }

    QMap<QString, QStringList> rows; // by the interface; for a service by its name and what the rows are
    QStringList headings;
    Records records;

private:
    template <typename Interface>
    void addService()
    {
        const ServiceTable::Service* service = ServiceTable::findByInterface(Interface::INTERFACE_ID);
        headings.append(QString("%1 — interface id %2, key %3, port %4")
                            .arg(Interface::NAME)
                            .arg(Interface::INTERFACE_ID)
                            .arg(service->clientKey)
                            .arg(Interface::CLIENT));
        addRows<Interface>(QString(Interface::NAME) + " calls");
    }
    template <typename Interface>
    void addRows(const QString& title)
    {
        Interface::forEachMethod([&](long id, const char* name, auto method, const char* parameter) {
            rows[title].append(QString("%1 `%2` %3").arg(id).arg(QString(name), payload(method, parameter)));
        });
    }

    template <typename Interface>
    QString payload(void (Interface::*)(), const char*)
    {
        return "none";
    }
    template <typename Interface, typename Parameter>
    QString payload(void (Interface::*)(Parameter), const char* name)
    {
        using Packed = typename ServiceCall::Packed<Parameter>::Type;
        if constexpr (RecordPacking::HasFields<Packed>) {
            QStringList& fields = records[Packed::NAME];
            fields.clear();
            Packed record;
            Packed::forEachField(record, [&fields](auto form, const char* fieldName, const auto&) {
                fields.append(field(fieldName, kindOf(form)));
            });
            return QString("`%1`").arg(Packed::NAME);
        } else if constexpr (std::is_same_v<Packed, _CALLBACK_TITLER_PARAMTER>) {
            return "`_CALLBACK_TITLER_PARAMTER`";
        } else {
            return field(name, kindOfValue(Packed()));
        }
    }
};

// The page's lines by its headings, those of the services under the service's name.
class Page
{
public:
    Page()
    {
        QFile file(PROTOCOL_PAGE);
        if (!file.open(QIODevice::ReadOnly))
            return;
        QString heading;
        const QStringList lines = QString::fromUtf8(file.readAll()).split('\n');
        for (const QString& line : lines) {
            if (line.startsWith("## ") || line.startsWith("### ")) {
                heading = line.mid(line.indexOf(' ') + 1);
                headings.append(heading);
            }
            m_lines[heading].append(line);
        }
    }

    // The cells of the rows of all tables below a heading that begins so, without the lines above them.
    QList<QStringList> cells(const QString& heading) const
    {
        QList<QStringList> found;
        for (const QString& line : lines(heading)) {
            if (!line.startsWith('|') || line.startsWith("|-"))
                continue;
            QStringList row = line.mid(1, line.lastIndexOf('|') - 1).split('|');
            for (QString& cell : row)
                cell = cell.trimmed();
            found.append(row);
        }
        return found;
    }
    QStringList lines(const QString& heading) const
    {
        for (auto at = m_lines.cbegin(); at != m_lines.cend(); ++at)
            if (at.key().startsWith(heading))
                return at.value();
        return {};
    }

    QStringList headings;

private:
    QMap<QString, QStringList> m_lines;
};

} // namespace

class tst_servicetable_protocol : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void offeredService();
    void calledServices_data();
    void calledServices();
    void records();
    void allServices();

private:
    const ServiceRows m_program;
    const Page m_page;
};

void tst_servicetable_protocol::offeredService()
{
    QVERIFY(m_page.lines("5. ").contains(QString("`ITitler`: object id %1 at port %2, receiver id %3.")
                                             .arg(ITitler::INTERFACE_ID)
                                             .arg(ITitler::CLIENT)
                                             .arg(ServiceTable::TITLER_CLIENT_KEY)));
    QStringList rows;
    for (const QStringList& cells : m_page.cells("5. "))
        if (cells.first() != "Method id")
            rows.append(cells.join(' '));
    QCOMPARE(rows, m_program.rows["ITitler"] + m_program.rows["ITitlerCallBack"]);
}

void tst_servicetable_protocol::calledServices_data()
{
    QTest::addColumn<QString>("heading");
    for (const QString& heading : m_program.headings)
        QTest::newRow(qPrintable(heading.section(' ', 0, 0))) << heading;
}

void tst_servicetable_protocol::calledServices()
{
    QFETCH(QString, heading);
    const QString service = heading.section(' ', 0, 0);
    QVERIFY2(m_page.headings.contains(heading), qPrintable(heading));
    QMap<QString, QStringList> rows;
    QString left;
    for (const QStringList& cells : m_page.cells(heading)) {
        if (cells.first() == "Id") {
            left = cells.at(1) == "Call" ? "calls" : "answers";
            continue;
        }
        if (!cells.first().isEmpty())
            rows[left].append(cells.mid(0, 3).join(' '));
        if (cells.size() == 7 && !cells.at(4).isEmpty())
            rows["events"].append(cells.mid(4).join(' '));
    }
    for (const char* kind : {"calls", "answers", "events"})
        QCOMPARE(rows[kind], m_program.rows[service + " " + kind]);
}

void tst_servicetable_protocol::records()
{
    static const QRegularExpression kinds(
        "(\\w[\\w ]*) \\(((?:three |four |seven )?(?:int|int32|long|bool|bool as int|wide|raw))\\)");
    Records records;
    for (const QStringList& cells : m_page.cells("4. ") + m_page.cells("7. ")) {
        if (cells.first() == "Record")
            continue;
        QStringList& fields = records[QString(cells.first()).remove('`')];
        auto found = kinds.globalMatch(cells.at(1));
        while (found.hasNext())
            fields.append(found.next().captured(0));
    }
    QCOMPARE(records.keys(), m_program.records.keys());
    for (const QString& record : records.keys())
        QCOMPARE(records[record], m_program.records[record]);
}

void tst_servicetable_protocol::allServices()
{
    QStringList rows;
    for (const QStringList& cells : m_page.cells("8. "))
        if (cells.first() != "Interface id")
            rows.append(cells.join(' '));
    const auto adapter = [](long type) {
        return type == ServiceTable::NO_ADAPTER ? QString("none") : QString::number(type);
    };
    QStringList wanted;
    for (const ServiceTable::Service& service : ServiceTable::services()) {
        wanted.append(QString("%1 `%2` %3 %4 %5 %6 %7")
                          .arg(service.interfaceId)
                          .arg(service.name)
                          .arg(service.clientKey)
                          .arg(service.port)
                          .arg(service.methods)
                          .arg(adapter(service.callBackAdapter), adapter(service.notifyAdapter)));
    }
    QCOMPARE(rows, wanted);
}

QTEST_GUILESS_MAIN(tst_servicetable_protocol)
#include "tst_servicetable_protocol.moc"
