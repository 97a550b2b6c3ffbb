// SPDX-License-Identifier: MIT
// A slider with any number of handles on one scale: its handles and their layout. Other files have the operations
// by id (Handles), the mouse (Interaction), what it does as a widget (Widget), what it paints (Painting), and the
// flags.
#include "sliders/MultiNubsieSlider.h"

#include "CoreQt/Connect.h"
#include "sliders/NubsieGeometry.h"
#include "sliders/NubsieLayout.h"
#include "sliders/SliderDecoration.h"

#include <QtWidgets/QApplication>

#include <algorithm>
#include <vector>

namespace vx
{
namespace
{
constexpr int c_LongClickTime = 1500; // ms

int middleOf(int minimum, int maximum)
{
    const qint64 length = static_cast<qint64>(maximum) - minimum;
    return static_cast<int>(maximum - length / 2);
}

QPixmap shrunkFlagPicture(const QPixmap& picture)
{
    return picture.isNull() ? picture
                            : picture.scaled(SliderDecoration::shrunkFlagSize(picture.size()),
                                Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
}

int lengthAlong(const QSize& size, Qt::Orientation orientation)
{
    return orientation == Qt::Horizontal ? size.width() : size.height();
}

// The handles as the layout sees them: a row sorted by where they are drawn.
class NubsieRow
{
public:
    explicit NubsieRow(std::vector<Nubsie*> nubsies)
    {
        std::vector<NubsieLayout::Place> places;
        places.reserve(nubsies.size());
        for (const Nubsie* nubsie : nubsies) {
            places.push_back({nubsie->getDisplayValue(), nubsie->normalizedValue()});
        }
        for (const int index : NubsieLayout::sortedByDisplay(places)) {
            m_nubsies.push_back(nubsies[static_cast<std::size_t>(index)]);
            m_places.push_back(places[static_cast<std::size_t>(index)]);
        }
    }

    NubsieLayout::Place* places() { return m_places.data(); }
    int count() const { return static_cast<int>(m_places.size()); }

    /// -1 if it is not in the row.
    int indexOf(const Nubsie* nubsie) const
    {
        const auto found = std::find(m_nubsies.begin(), m_nubsies.end(), nubsie);
        return found == m_nubsies.end() ? -1 : static_cast<int>(found - m_nubsies.begin());
    }

    /// The new place goes to the handles of the block; they are returned.
    QList<QPointer<Nubsie>> take(const NubsieLayout::Block& block) const
    {
        QList<QPointer<Nubsie>> result;
        for (int k = block.first; k <= block.last; ++k) {
            const std::size_t at = static_cast<std::size_t>(k);
            m_nubsies[at]->setDisplayValue(m_places[at].display);
            result.append(m_nubsies[at]);
        }
        return result;
    }

private:
    std::vector<Nubsie*> m_nubsies;
    std::vector<NubsieLayout::Place> m_places;
};
}

MultiNubsieSlider::MultiNubsieSlider(QWidget* parent, QWidget* window)
    : QWidget(parent)
    , m_features(QFlags<EMultiNubsieSliderFeatures>(emfDirectMapping) | emfReserved8)
    , m_opacityAnimator(this, "opacityFactor")
    , m_longClickTimer(this)
    , m_flagLongClickTimer(this)
    , m_handleWindow(window != nullptr ? window : this)
    , m_firstFlag(new QLabel(this))
    , m_secondFlag(new QLabel(this))
    , m_firstFlagPixmap(QStringLiteral(":/views/btn_flag_gray1.png"))
    , m_secondFlagPixmap(QStringLiteral(":/views/btn_flag_gray2.png"))
{
    vx::connect(&m_opacityAnimator, "2valueChanged( const QVariant & )", this, "1update()", Qt::AutoConnection);
    vx::connect(this, "2nubsieValueChanged(vx::NubsieID,int)", this, "1setActiveOpacity()", Qt::AutoConnection);
    vx::connect(
        this, "2triggerNubsieRepaintQueued(bool)", this, "1updateNubsiePositions(bool)", Qt::QueuedConnection);

    m_longClickTimer.setSingleShot(true);
    m_longClickTimer.setInterval(c_LongClickTime);
    m_flagLongClickTimer.setSingleShot(true);
    m_flagLongClickTimer.setInterval(static_cast<int>(s_FlagLongPressThreshold));
    m_singleClickTimer.setSingleShot(true);
    m_singleClickTimer.setInterval(QApplication::doubleClickInterval());
    vx::connect(&m_longClickTimer, "2timeout()", this, "1longClickEvent()", Qt::AutoConnection);
    vx::connect(&m_flagLongClickTimer, "2timeout()", this, "1flagLongClickEvent()", Qt::AutoConnection);
    vx::connect(&m_singleClickTimer, "2timeout()", this, "1singleClickPerformed()", Qt::AutoConnection);

    setInActiveOpacity();
    showFlags(false);
    m_firstFlag->setToolTip(tr("Export range start marker"));
    m_secondFlag->setToolTip(tr("Export range end marker"));
    m_firstFlagPixmap = shrunkFlagPicture(m_firstFlagPixmap);
    m_secondFlagPixmap = shrunkFlagPicture(m_secondFlagPixmap);
}

MultiNubsieSlider::~MultiNubsieSlider()
{
    if (m_handleWindow == this) {
        return;
    }
    for (const QPointer<Nubsie>& nubsie : qAsConst(m_nubsies)) {
        if (nubsie) {
            nubsie->deleteLater();
        }
    }
}

// Handles ----------------------------------------------------------------------------------------------------

int MultiNubsieSlider::addNubsie(const QString& name, int value, int minimum, int maximum, int id)
{
    return addNubsie(name, value, minimum, maximum, middleOf(minimum, maximum), id);
}

int MultiNubsieSlider::addNubsie(
    const QString& name, int value, int minimum, int maximum, int defaultValue, int id)
{
    // Clients rely on the middle of the range as the default, whatever they give here.
    Q_UNUSED(defaultValue)
    if (id < 0 || nubsieExists(id)) {
        return Nubsie::s_InvalidNubsieID;
    }
    addNubsie(new Nubsie(name, value, minimum, maximum, middleOf(minimum, maximum), window(), id));
    return id;
}

void MultiNubsieSlider::addNubsie(Nubsie* nubsie)
{
    if (nubsie == nullptr) {
        return;
    }
    vx::connect(nubsie, "2valuePopoverClosing()", this, "1nubsiePopoverClosing()", Qt::QueuedConnection);
    vx::connect(nubsie, "2valueChanged(int)", this, "1nubsieValueChanged(int)", Qt::AutoConnection);
    vx::connect(nubsie, "2valueChangedbyPopover(int)", this, "1nubsieValueChanged(int)", Qt::AutoConnection);
    vx::connect(nubsie->sizeAnimator(), "2valueChanged(const QVariant&)", nubsie, "1update()", Qt::AutoConnection);
    vx::connect(
        nubsie->positionAnimator(), "2valueChanged(const QVariant&)", this, "1update()", Qt::AutoConnection);
    vx::connect(
        nubsie, "2dragSizeChanged(Nubsie*,QSize)", this, "1dragSizeChanged(Nubsie*,QSize)", Qt::AutoConnection);
    m_nubsies.append(nubsie);
    nubsie->setNubsieSlider(this);
    if (Nubsie* const first = firstLiveNubsie()) {
        nubsie->stackUnder(first);
    }
    nubsie->setVisible(m_nubsiesShown);
    updateNubsiePositionsQueued(false);
}

void MultiNubsieSlider::removeNubsie(const int& id)
{
    const QPointer<Nubsie> found = nubsie(id);
    if (!found) {
        return;
    }
    // The entry goes first: deleting a widget calls out.
    m_nubsies.removeOne(found);
    const QPointer<MultiNubsieSlider> self(this);
    delete found.data();
    if (self) {
        update();
    }
}

void MultiNubsieSlider::removeAllNubsies()
{
    const QList<QPointer<Nubsie>> nubsies = m_nubsies;
    m_nubsies.clear();
    const QPointer<MultiNubsieSlider> self(this);
    for (const QPointer<Nubsie>& nubsie : nubsies) {
        delete nubsie.data();
    }
    if (self) {
        update();
    }
}

QList<QPointer<Nubsie>> MultiNubsieSlider::getNubsies() const
{
    return m_nubsies;
}

Nubsie* MultiNubsieSlider::nubsie(const int& id) const
{
    for (const QPointer<Nubsie>& nubsie : m_nubsies) {
        if (nubsie && nubsie->id() == id) {
            return nubsie;
        }
    }
    return nullptr;
}

Nubsie* MultiNubsieSlider::firstLiveNubsie() const
{
    for (const QPointer<Nubsie>& nubsie : m_nubsies) {
        if (nubsie) {
            return nubsie;
        }
    }
    return nullptr;
}

void MultiNubsieSlider::setNubsieVisible(int id, bool visible)
{
    const QPointer<Nubsie> found = nubsie(id);
    if (!found || found->externallyVisible() == visible) {
        return;
    }
    found->setExternallyVisible(visible);
    if (found) {
        found->update();
    }
    if (isVisible()) {
        updateNubsiePositions(false);
    }
}

void MultiNubsieSlider::setNubsiesVisible(bool visible)
{
    const QList<QPointer<Nubsie>> nubsies = m_nubsies;
    for (const QPointer<Nubsie>& nubsie : nubsies) {
        if (nubsie) {
            nubsie->setExternallyVisible(visible);
        }
    }
    if (isVisible()) {
        updateNubsiePositions(false);
    }
}

// Geometry ---------------------------------------------------------------------------------------------------

QRectF MultiNubsieSlider::sliderBarRect() const
{
    return NubsieGeometry::barRect(rect(), m_sliderBarExtent, m_orientation);
}

double MultiNubsieSlider::extent(const Nubsie* nubsie) const
{
    return NubsieGeometry::extent(sliderBarRect(), nubsie->getSize(), m_orientation);
}

QPoint MultiNubsieSlider::sliderOrigin() const
{
    return isVisible() ? mapTo(window(), QPoint(0, 0)) : QPoint(0, 0);
}

QPointF MultiNubsieSlider::nubsiePos(const Nubsie* nubsie) const
{
    return NubsieGeometry::position(
        sliderBarRect(), sliderOrigin(), nubsie->getSize(), nubsie->getDisplayValue(), m_orientation);
}

QRectF MultiNubsieSlider::nubsieRect(const Nubsie* nubsie) const
{
    const QPointF half(nubsie->getSize().width() * 0.5, nubsie->getSize().height() * 0.5);
    const QPointF centre = nubsiePos(nubsie);
    return QRectF(centre - half, centre + half);
}

double MultiNubsieSlider::distanceToNubsieCenter(const Nubsie* nubsie, const QPointF& point) const
{
    const QRectF rect = nubsieRect(nubsie);
    return m_orientation == Qt::Horizontal ? point.x() - (rect.x() + rect.width() * 0.5)
                                           : point.y() - (rect.y() + rect.height() * 0.5);
}

// Layout -----------------------------------------------------------------------------------------------------

void MultiNubsieSlider::enqueueNubsie(Nubsie* nubsie, bool animated)
{
    if (!isVisible()) {
        return;
    }
    std::vector<Nubsie*> visible;
    for (const QPointer<Nubsie>& one : qAsConst(m_nubsies)) {
        if (one && one->externallyVisible()) {
            visible.push_back(one);
        }
    }
    NubsieRow row(std::move(visible));
    const int index = row.indexOf(nubsie);
    if (index < 0) {
        return;
    }
    const double length
        = NubsieLayout::handleLength(lengthAlong(nubsie->getSize(), m_orientation), extent(nubsie));
    const QList<QPointer<Nubsie>> block
        = row.take(NubsieLayout::enqueue(row.places(), row.count(), index, length));
    const Frame place = frame();
    for (const QPointer<Nubsie>& one : block) {
        placeNubsie(one, place, animated);
    }
}

void MultiNubsieSlider::dequeueNubsie(Nubsie* nubsie)
{
    std::vector<Nubsie*> all;
    for (const QPointer<Nubsie>& one : qAsConst(m_nubsies)) {
        if (one) {
            all.push_back(one);
        }
    }
    NubsieRow row(std::move(all));
    const int index = row.indexOf(nubsie);
    if (index < 0) {
        return;
    }
    const double length
        = NubsieLayout::handleLength(lengthAlong(nubsie->getSize(), m_orientation), extent(nubsie));
    const NubsieLayout::Drift drift = NubsieLayout::dequeue(row.places(), row.count(), index, length);
    const QList<QPointer<Nubsie>> moved = row.take(drift.below) + row.take(drift.above);
    const Frame place = frame();
    for (const QPointer<Nubsie>& one : moved) {
        if (one) {
            one->moveTo(place.position(one));
        }
    }
}

void MultiNubsieSlider::updateNubsiePositions(bool animated)
{
    const QPointer<MultiNubsieSlider> self(this);
    if (isVisible()) {
        // Every handle is enqueued in turn, but placed only once, where the last of them has left it.
        QList<QPointer<Nubsie>> visible;
        std::vector<NubsieLayout::Place> places;
        std::vector<double> lengths;
        const Frame place = frame();
        for (const QPointer<Nubsie>& nubsie : qAsConst(m_nubsies)) {
            if (nubsie && nubsie->externallyVisible()) {
                visible.append(nubsie);
                places.push_back({nubsie->getDisplayValue(), nubsie->normalizedValue()});
                lengths.push_back(NubsieLayout::handleLength(lengthAlong(nubsie->getSize(), m_orientation),
                    NubsieGeometry::extent(place.bar, nubsie->getSize(), m_orientation)));
            }
        }
        NubsieLayout::enqueueAll(places, lengths);
        for (int i = 0; i < visible.size(); ++i) {
            visible.at(i)->setDisplayValue(places[static_cast<std::size_t>(i)].display);
        }
        for (const QPointer<Nubsie>& nubsie : qAsConst(visible)) {
            placeNubsie(nubsie, place, animated);
        }
    }
    if (self) {
        update();
    }
}

MultiNubsieSlider::Frame MultiNubsieSlider::frame() const
{
    return {sliderBarRect(), sliderOrigin(), m_orientation};
}

QPointF MultiNubsieSlider::Frame::position(const Nubsie* nubsie) const
{
    return NubsieGeometry::position(bar, origin, nubsie->getSize(), nubsie->getDisplayValue(), orientation);
}

void MultiNubsieSlider::placeNubsie(Nubsie* nubsie, const Frame& place, bool animated)
{
    if (nubsie == nullptr) {
        return;
    }
    const QPointF position = place.position(nubsie);
    if (animated && nubsie->getDraggedSize().isValid() && nubsie->getSize().isValid()) {
        nubsie->moveTo(position);
        return;
    }
    // A handle that is still on its way must not end at the old place.
    if (nubsie->positionAnimator()->state() == QAbstractAnimation::Running) {
        nubsie->positionAnimator()->setEndValue(position);
    }
    nubsie->setPosition(position);
}

void MultiNubsieSlider::updateNubsieLayer(Nubsie* nubsie)
{
    if (nubsie == nullptr || !isVisible()) {
        return;
    }
    const QPointer<Nubsie> guard(nubsie);
    const QPointF position = NubsieGeometry::positionInMotion(sliderBarRect(), sliderOrigin(), nubsie->getSize(),
        nubsie->getDraggedSize(), nubsie == m_currentNubsie, nubsie->getDisplayValue(), m_orientation);
    nubsie->setPosition(NubsieGeometry::rounded(position));
    if (guard) {
        guard->updateNubsie(true);
    }
}

void MultiNubsieSlider::repaintNubsiesQueued()
{
    Q_EMIT triggerNubsieRepaintQueued(false);
}

void MultiNubsieSlider::repaintNubsiesImmediately()
{
    updateNubsiePositions(false);
}

void MultiNubsieSlider::handleResize()
{
    updateNubsiePositions(false);
}

void MultiNubsieSlider::updateNubsiePositionsQueued(bool animated)
{
    QMetaObject::invokeMethod(this, "updateNubsiePositions", Qt::QueuedConnection, Q_ARG(bool, animated));
}

void MultiNubsieSlider::stopNubsieAnimations()
{
    const QList<QPointer<Nubsie>> nubsies = m_nubsies;
    for (const QPointer<Nubsie>& nubsie : nubsies) {
        if (nubsie) {
            nubsie->cancelAnimations();
        }
    }
}

void MultiNubsieSlider::cancelAnimations()
{
    stopNubsieAnimations();
}
}
