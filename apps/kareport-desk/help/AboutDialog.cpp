#include "AboutDialog.h"

#include "HelpWindow.h"
#include "PlainWidgets.h"
#include "ProgramIcon.h"
#include "Readable.h"
#include "Xlate.h"

#include <QDialogButtonBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QSysInfo>
#include <QVBoxLayout>

namespace kareport
{

namespace
{

/// Version and way of the build, which the user may copy into a message.
QLabel *selectable(const QString &text, QWidget *parent)
{
    auto *label = plainLabel(text, parent);
    label->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    label->setWordWrap(true);
    return label;
}

} // namespace

QString buildText()
{
    return Xlate("Built as %1 with %2 for %3, Qt %4.")
        .arg(QStringLiteral(KAREPORT_BUILD), QStringLiteral(KAREPORT_COMPILER), QSysInfo::buildAbi(),
             QString::fromLatin1(qVersion()));
}

AboutDialog::AboutDialog(QWidget *parent) : QDialog(parent)
{
    setWindowTitle(Xlate("About KaReport"));
    setWindowFlag(Qt::WindowContextHelpButtonHint, false);
    constexpr int pictureSide = 64;
    QLabel *picture = plainLabel(QString(), this);
    picture->setAccessibleName(Xlate("The program's icon"));
    const qreal ratio = devicePixelRatioF();
    QPixmap drawn = QPixmap::fromImage(programPicture(qRound(pictureSide * ratio)));
    drawn.setDevicePixelRatio(ratio);
    picture->setPixmap(drawn);

    QLabel *name = plainLabel(QStringLiteral("KaReport"), this);
    makeCaption(*name);
    QLabel *version = selectable(Xlate("Version %1").arg(QStringLiteral(KAREPORT_VERSION)), this);
    QLabel *build = selectable(buildText(), this);
    makeQuiet(*build);
    QLabel *what = plainLabel(Xlate("Fixed-pitch reports for civil engineering and surveying."), this);
    what->setWordWrap(true);
    QLabel *licences = plainLabel(
        Xlate("Qt is used under the LGPL, version 3. All libraries and their licences are listed under Licences."),
        this);
    licences->setWordWrap(true);

    auto *texts = new QVBoxLayout;
    for (QLabel *label : {name, version, build, what, licences}) {
        texts->addWidget(label);
    }
    texts->addStretch();
    auto *row = new QHBoxLayout;
    row->setSpacing(16);
    row->addWidget(picture, 0, Qt::AlignTop);
    row->addLayout(texts, 1);
    auto *buttons = new QDialogButtonBox(QDialogButtonBox::Close);
    auto *list = buttons->addButton(Xlate("&Licences"), QDialogButtonBox::ActionRole);
    connect(list, &QPushButton::clicked, this, [this] { showGuide(*this, QStringLiteral("LICENSES.md")); });
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    auto *layout = new QVBoxLayout(this);
    layout->addLayout(row);
    layout->addWidget(buttons);
    constexpr int characters = 64;
    resize(fontMetrics().averageCharWidth() * characters, sizeHint().height());
}

} // namespace kareport
