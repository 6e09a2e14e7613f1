#include "popuprounds.h"

#include "sides.h"

namespace {

/** One operation is the whole round: request, interruption, dismissal, return, dismissal. */
template <typename Base> class PopupRound : public Base
{
public:
    explicit PopupRound(const FlowShape &shape)
        : Base(shape), m_first(shape.popupNames().at(0)), m_second(shape.popupNames().at(1)),
          m_dismissFirst(this->dismissIdentifier(m_first)),
          m_dismissSecond(this->dismissIdentifier(m_second))
    {
    }

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            this->requestPopup(m_first, i);
            this->requestPopup(m_second, i);
            this->dismissPopup(m_dismissSecond); // and the first comes back
            this->dismissPopup(m_dismissFirst);
        }
    }

private:
    QString m_first;
    QString m_second;
    QString m_dismissFirst;
    QString m_dismissSecond;
};

Workload popupRound(int popups)
{
    FlowShape shape;
    shape.views = 2;
    shape.layers = 1;
    shape.popups = popups;
    return {QStringLiteral("W3/%1").arg(popups),
            QStringLiteral("popup interrupted and dismissed, one of %1").arg(popups),
            50,
            30,
            2,
            severalLayouts,
            libraryAndRaw<PopupRound>(shape)};
}

} // namespace

QVector<Workload> popupRoundWorkloads()
{
    return {popupRound(16), popupRound(512)};
}
