/* Numbers of the program's resources, for the resource compiler and for the code. */
#pragma once

#define ICONE_PROGRAMA 1
#define ICONE_DISQUETE 101
#define ICONE_SALVAMENTOS 102
#define ICONE_BAIXAR 103
#define ICONE_IMPORTAR 104
#define ICONE_EXPORTAR 105
#define ICONE_DELETAR 106
#define ICONE_SETA_ESQUERDA 107
#define ICONE_SETA_DIREITA 108

/* Picture files. */
#define FIGURA_PREVIA 201
#define FIGURA_CONTROLE 202
#define FIGURA_EXCLUIR 203
