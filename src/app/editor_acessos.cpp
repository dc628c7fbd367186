#include "app/editor_acessos.h"

#include <QHash>

namespace brasel::app {

QList<int> paisDireitos(const QList<DireitoAcesso>& direitos) {
    QHash<QString, int> porChave;
    for (int i = 0; i < direitos.size(); ++i)
        porChave.insert(direitos[i].chave, i);
    QList<int> pais;
    pais.reserve(direitos.size());
    for (int i = 0; i < direitos.size(); ++i) {
        const int pai = direitos[i].chave1.isEmpty() ? -1 : porChave.value(direitos[i].chave1, -1);
        pais.append(pai == i ? -1 : pai);
    }
    // A chain of parents that comes back to where it started would hang the tree off itself: it
    // is cut where it is found, that right becoming a root.
    for (int i = 0; i < pais.size(); ++i) {
        int passo = pais[i];
        for (int n = 0; passo >= 0 && n < pais.size(); ++n) {
            if (passo == i) {
                pais[i] = -1;
                break;
            }
            passo = pais[passo];
        }
    }
    return pais;
}

QString textoDireito(const DireitoAcesso& direito) {
    const bool botao = !direito.ctrl.isEmpty();
    const QString caption = botao ? direito.ctrlcap : direito.caption;
    const QString nome = botao ? direito.ctrl : direito.form;
    if (caption.trimmed().isEmpty()) return direito.chave;
    if (nome.isEmpty()) return caption;
    return caption + QStringLiteral(" (") + nome + QLatin1Char(')');
}

QList<UtilizadorEditavel> utilizadoresEditaveis(Estado& estado) {
    QList<UtilizadorEditavel> lista;
    auto q = estado.gConn.exec(
        QStringLiteral("select Codigo, Login from Utilizador where Codigo>? order by Codigo"),
        {QStringLiteral("01")});
    while (q && q->next())
        lista.append({q->value(0).toString().trimmed(), q->value(1).toString().trimmed()});
    return lista;
}

}  // namespace brasel::app
