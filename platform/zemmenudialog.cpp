#include "zemmenudialog.h"

#include "zemini.h"

#include <QDialogButtonBox>
#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QFileInfo>
#include <QHash>
#include <QHeaderView>
#include <QIcon>
#include <QLabel>
#include <QLineEdit>
#include <QLocale>
#include <QMap>
#include <QPushButton>
#include <QSet>
#include <QTreeWidget>
#include <QVBoxLayout>

#include <algorithm>

namespace {

// Desktop entries are small; anything larger is not one.
constexpr qint64 largestDesktopEntry = 256 * 1024;
constexpr char desktopEntrySection[] = "Desktop Entry";

struct MainCategory
{
    const char* name;
    const char* title;
};

// The freedesktop main categories, in the order their groups are shown.
constexpr MainCategory mainCategories[] = {
    {"AudioVideo", QT_TRANSLATE_NOOP("ZemMenuDialog", "Multimedia")},
    {"Audio", QT_TRANSLATE_NOOP("ZemMenuDialog", "Multimedia")},
    {"Video", QT_TRANSLATE_NOOP("ZemMenuDialog", "Multimedia")},
    {"Development", QT_TRANSLATE_NOOP("ZemMenuDialog", "Development")},
    {"Education", QT_TRANSLATE_NOOP("ZemMenuDialog", "Education")},
    {"Game", QT_TRANSLATE_NOOP("ZemMenuDialog", "Games")},
    {"Graphics", QT_TRANSLATE_NOOP("ZemMenuDialog", "Graphics")},
    {"Network", QT_TRANSLATE_NOOP("ZemMenuDialog", "Internet")},
    {"Office", QT_TRANSLATE_NOOP("ZemMenuDialog", "Office")},
    {"Science", QT_TRANSLATE_NOOP("ZemMenuDialog", "Science")},
    {"Settings", QT_TRANSLATE_NOOP("ZemMenuDialog", "Settings")},
    {"System", QT_TRANSLATE_NOOP("ZemMenuDialog", "System")},
    {"Utility", QT_TRANSLATE_NOOP("ZemMenuDialog", "Accessories")},
};

QStringList dataDirectories()
{
    QString home = QString::fromLocal8Bit(qgetenv("XDG_DATA_HOME"));
    if (home.isEmpty())
        home = QDir::homePath() + QLatin1String("/.local/share");
    QString others = QString::fromLocal8Bit(qgetenv("XDG_DATA_DIRS"));
    if (others.isEmpty())
        others = QStringLiteral("/usr/local/share:/usr/share");
    QStringList directories{home};
    for (const QString& dir : others.split(QLatin1Char(':'), Qt::SkipEmptyParts))
        directories << dir;
    return directories;
}

class DesktopEntry
{
public:
    bool load(const QString& path)
    {
        QFile file(path);
        if (file.size() > largestDesktopEntry || !file.open(QIODevice::ReadOnly))
            return false;
        const QByteArray bytes = file.read(largestDesktopEntry + 1);
        if (bytes.size() > largestDesktopEntry || bytes.contains('\0'))
            return false;
        return ini.LoadData(bytes.constData(), size_t(bytes.size())) >= 0 &&
               ini.GetSectionSize(desktopEntrySection) > 0;
    }

    QString value(const char* key) const
    {
        return QString::fromUtf8(ini.GetValue(desktopEntrySection, key, ""));
    }

    bool flag(const char* key) const { return value(key).trimmed() == QLatin1String("true"); }

    // The value for the current language: Key[ll_CC], then Key[ll], then Key.
    QString localized(const char* key) const
    {
        const QString locale = QLocale().name();
        const QStringList candidates{
            QStringLiteral("%1[%2]").arg(QLatin1String(key), locale),
            QStringLiteral("%1[%2]").arg(QLatin1String(key), locale.section('_', 0, 0))};
        for (const QString& candidate : candidates) {
            const char* found = ini.GetValue(desktopEntrySection, candidate.toUtf8().constData(), nullptr);
            if (found && *found)
                return QString::fromUtf8(found);
        }
        return value(key);
    }

private:
    ZemIni ini{true, false, false};
};

QString mainCategoryOf(const QString& categories)
{
    const QStringList listed = categories.split(QLatin1Char(';'), Qt::SkipEmptyParts);
    for (const QString& category : listed) {
        for (const MainCategory& main : mainCategories) {
            if (category == QLatin1String(main.name))
                return QLatin1String(main.name);
        }
    }
    return QString();
}

QString categoryTitle(const QString& category)
{
    for (const MainCategory& main : mainCategories) {
        if (category == QLatin1String(main.name))
            return ZemMenuDialog::tr(main.title);
    }
    return ZemMenuDialog::tr("Other");
}

} // namespace

QVector<DesktopApplication> installedApplications()
{
    QVector<DesktopApplication> applications;
    QSet<QString> seenIds;
    for (const QString& base : dataDirectories()) {
        const QString root = base + QLatin1String("/applications");
        QDirIterator it(root, {QStringLiteral("*.desktop")}, QDir::Files | QDir::Readable,
                        QDirIterator::Subdirectories | QDirIterator::FollowSymlinks);
        QStringList paths;
        while (it.hasNext())
            paths << it.next();
        paths.sort();
        for (const QString& path : qAsConst(paths)) {
            const QString id = QDir(root).relativeFilePath(path).replace(QLatin1Char('/'), QLatin1Char('-'));
            // The first directory that has an id decides it, even when it hides the entry.
            if (seenIds.contains(id))
                continue;
            seenIds.insert(id);

            DesktopEntry entry;
            if (!entry.load(path))
                continue;
            if (entry.value("Type").trimmed() != QLatin1String("Application") || entry.flag("NoDisplay") ||
                entry.flag("Hidden"))
                continue;
            DesktopApplication application;
            application.id = id;
            application.name = entry.localized("Name").trimmed();
            application.exec = entry.value("Exec").trimmed();
            if (application.name.isEmpty() || application.exec.isEmpty())
                continue;
            application.comment = entry.localized("Comment").trimmed();
            if (application.comment.isEmpty())
                application.comment = entry.localized("GenericName").trimmed();
            application.icon = entry.value("Icon").trimmed();
            application.category = mainCategoryOf(entry.value("Categories"));
            applications.append(application);
        }
    }
    std::sort(applications.begin(), applications.end(),
              [](const DesktopApplication& a, const DesktopApplication& b) {
                  return QString::localeAwareCompare(a.name, b.name) < 0;
              });
    return applications;
}

QString execWithoutFieldCodes(const QString& exec)
{
    QString result;
    result.reserve(exec.size());
    for (int i = 0; i < exec.size(); ++i) {
        if (exec.at(i) != QLatin1Char('%') || i + 1 == exec.size()) {
            result += exec.at(i);
            continue;
        }
        const QChar code = exec.at(++i);
        if (code == QLatin1Char('%')) {
            result += QLatin1Char('%');
            continue;
        }
        // Every other field code (%f %F %u %U %i %c %k and the deprecated %d %D %n %N %v %m)
        // stands for something only a launcher can supply; the blank before it goes too.
        if (result.endsWith(QLatin1Char(' ')) && (i + 1 == exec.size() || exec.at(i + 1) == QLatin1Char(' ')))
            result.chop(1);
    }
    return result.trimmed();
}

ZemMenuDialog::ZemMenuDialog(QWidget* parent) : QDialog(parent)
{
    setWindowTitle(tr("Choose an application"));

    filterEdit = new QLineEdit(this);
    filterEdit->setObjectName(QStringLiteral("filterEdit"));
    filterEdit->setPlaceholderText(tr("Filter"));
    filterEdit->setClearButtonEnabled(true);

    applicationTree = new QTreeWidget(this);
    applicationTree->setObjectName(QStringLiteral("applicationTree"));
    applicationTree->setColumnCount(2);
    applicationTree->setHeaderHidden(true);
    applicationTree->setRootIsDecorated(true);
    applicationTree->header()->setSectionResizeMode(0, QHeaderView::ResizeToContents);

    emptyLabel = new QLabel(tr("No installed applications were found. Applications appear here when "
                               "their desktop entries are installed in an applications directory."),
                            this);
    emptyLabel->setObjectName(QStringLiteral("emptyLabel"));
    emptyLabel->setWordWrap(true);

    buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this);
    connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    connect(filterEdit, &QLineEdit::textChanged, this, &ZemMenuDialog::applyFilter);
    connect(applicationTree, &QTreeWidget::currentItemChanged, this, &ZemMenuDialog::updateOkButton);
    connect(applicationTree, &QTreeWidget::itemActivated, this, [this](QTreeWidgetItem* item) {
        if (item && item->parent())
            accept();
    });

    auto* layout = new QVBoxLayout(this);
    layout->addWidget(filterEdit);
    layout->addWidget(applicationTree);
    layout->addWidget(emptyLabel);
    layout->addWidget(buttons);
    resize(520, 520);

    fill();
    filterEdit->setFocus();
}

ZemMenuDialog::~ZemMenuDialog() = default;

void ZemMenuDialog::fill()
{
    const QVector<DesktopApplication> applications = installedApplications();
    QMap<QString, QTreeWidgetItem*> groups; // by title, so groups are in alphabetical order
    for (const DesktopApplication& application : applications) {
        const QString title = categoryTitle(application.category);
        QTreeWidgetItem*& group = groups[title];
        if (!group) {
            group = new QTreeWidgetItem({title});
            group->setFlags(Qt::ItemIsEnabled);
        }
        auto* item = new QTreeWidgetItem(group, {application.name, application.comment});
        const QIcon icon = QFileInfo(application.icon).isAbsolute() ? QIcon(application.icon)
                                                                    : QIcon::fromTheme(application.icon);
        item->setIcon(0, icon);
        item->setData(0, Qt::UserRole, application.exec);
        item->setToolTip(0, execWithoutFieldCodes(application.exec));
    }
    applicationTree->addTopLevelItems(groups.values());
    applicationTree->expandAll();
    emptyLabel->setVisible(applications.isEmpty());
    filterEdit->setEnabled(!applications.isEmpty());
    updateOkButton();
}

void ZemMenuDialog::applyFilter(const QString& text)
{
    const QString wanted = text.trimmed();
    for (int g = 0; g < applicationTree->topLevelItemCount(); ++g) {
        QTreeWidgetItem* group = applicationTree->topLevelItem(g);
        int shown = 0;
        for (int i = 0; i < group->childCount(); ++i) {
            QTreeWidgetItem* item = group->child(i);
            const bool match = wanted.isEmpty() || item->text(0).contains(wanted, Qt::CaseInsensitive) ||
                               item->text(1).contains(wanted, Qt::CaseInsensitive) ||
                               item->data(0, Qt::UserRole).toString().contains(wanted, Qt::CaseInsensitive);
            item->setHidden(!match);
            shown += match ? 1 : 0;
        }
        group->setHidden(shown == 0);
    }
    QTreeWidgetItem* current = applicationTree->currentItem();
    if (current && current->isHidden())
        applicationTree->setCurrentItem(nullptr);
    updateOkButton();
}

void ZemMenuDialog::updateOkButton()
{
    const QTreeWidgetItem* current = applicationTree->currentItem();
    buttons->button(QDialogButtonBox::Ok)->setEnabled(current && current->parent() && !current->isHidden());
}

QString ZemMenuDialog::selectedItemExec(const QString&, const QString&, const QStringList*,
                                        const QStringList*) const
{
    const QTreeWidgetItem* item = applicationTree->currentItem();
    if (!item || !item->parent())
        return QString();
    return execWithoutFieldCodes(item->data(0, Qt::UserRole).toString());
}
