; A small program for the Super Nintendo: its title waves before a sky that changes colour, over stars that
; the direction pad steers. Its battery-backed memory counts how often it was started.
; 32 KiB, no banks; the pictures and the title come from draw.py.

.p816
.smart

.include "console.inc"

SRAM    = $700000
SIGNATURE = $5654         ; "TV"

; Places in video memory, in words.
TEXT_TILES = $0000
STAR_TILES = $2000
TEXT_MAP   = $4000
STAR_MAP   = $4400
COUNTER    = TEXT_MAP + 25 * 32 + 18

SKY_STRIPS = 32           ; of 7 lines each
WAVE_TOP   = 24           ; the title's first line
WAVES      = 40           ; of 2 lines each

.zeropage
frame:    .res 2
stars_x:  .res 2
stars_y:  .res 2
speed_x:  .res 2
speed_y:  .res 2
digits:   .res 2

.bss
sky:      .res SKY_STRIPS * 5 + 1    ; line count, colour's number twice, colour
wave:     .res 3 + WAVES * 3 + 4     ; line count, horizontal offset

.code

reset:
  sei
  clc
  xce                     ; 16-bit processor
  rep #$38                ; no decimals, A and X 16 bits
  ldx #$1FFF
  txs
  lda #0
  tcd
  sep #$20
  pha
  plb
  lda #$8F
  sta INIDISP             ; display off
  jsr clear_registers
  jsr clear_vram
  jsr load_pictures
  jsr load_colours
  jsr count_start
  jsr show_counter
  jsr make_tables
  jsr start_display
main:
  wai
  jsr read_pad
  jsr move
  jsr colour_sky
  jsr wave_title
  bra main

.include "clear.inc"

load_pictures:
  to_vram text_tiles, TEXT_TILES, text_tiles_end - text_tiles
  to_vram text_map, TEXT_MAP, 2048
  to_vram star_tiles, STAR_TILES, star_tiles_end - star_tiles
  to_vram star_map, STAR_MAP, 2048
  rts

; Each layer has its own colours: 0 for the text, 32 and 64 for the stars near and far.
load_colours:
  ldx #0
@layer:
  lda layer_colours,x
  sta CGADD
  inx
  ldy #8
@byte:
  lda layer_colours,x
  sta CGDATA
  inx
  dey
  bne @byte
  cpx #27
  bne @layer
  rts

; One more start, in decimal digits; the memory of a new cartridge holds anything.
count_start:
  rep #$20
  lda f:SRAM
  cmp #SIGNATURE
  beq @known
  lda #SIGNATURE
  sta f:SRAM
  lda #0
  sta f:SRAM + 2
@known:
  sed
  lda f:SRAM + 2
  clc
  adc #1
  sta f:SRAM + 2
  cld
  sta digits
  sep #$20
  rts

; Tiles 1 to 10 are the digits.
show_counter:
  ldx #COUNTER
  stx VMADD
  rep #$20
  ldy #4
@digit:
  lda digits
  xba
  lsr
  lsr
  lsr
  lsr
  and #$0F
  inc
  sta VMADD + 2
  lda digits
  asl
  asl
  asl
  asl
  sta digits
  dey
  bne @digit
  sep #$20
  rts

; What never changes in the tables that the screen reads line by line.
make_tables:
  ldx #0
@sky:
  lda #7
  sta sky,x
  inx
  inx
  inx
  inx
  inx
  cpx #SKY_STRIPS * 5
  bne @sky
  lda #WAVE_TOP
  sta wave
  ldx #3
@wave:
  lda #2
  sta wave,x
  inx
  inx
  inx
  cpx #3 + WAVES * 3
  bne @wave
  lda #1
  sta wave,x              ; the rest stands still
  rts

start_display:
  lda #0
  sta BGMODE              ; four layers of four colours
  lda #>TEXT_MAP
  sta BG1SC
  lda #>STAR_MAP
  sta BG2SC
  sta BG3SC
  lda #(STAR_TILES >> 8) | (TEXT_TILES >> 12)
  sta BG12NBA
  lda #STAR_TILES >> 12
  sta BG34NBA
  lda #$FF
  sta BG1VOFS             ; the first line is never seen
  sta BG1VOFS
  lda #%00000111
  sta TM
  ldx #$2103              ; CGADD, CGADD, CGDATA, CGDATA
  stx DMAP0
  ldx #sky
  stx A1T0
  stz A1B0
  ldx #$0D02              ; BG1HOFS twice
  stx DMAP0 + $10
  ldx #wave
  stx A1T0 + $10
  stz A1B0 + $10
  jsr colour_sky
  jsr wave_title
  lda #$81
  sta NMITIMEN            ; each picture interrupts, and the pad is read
  wai
  lda #%00000011
  sta HDMAEN
  lda #$0F
  sta INIDISP
  rts

; The pad's directions are the stars' speed; let go, they drift.
read_pad:
  lda HVBJOY
  and #1
  bne read_pad
  rep #$20
  lda #1
  sta speed_x
  stz speed_y
  lda JOY1
  bit #$0100
  beq @left
  ldy #4
  sty speed_x
@left:
  bit #$0200
  beq @down
  ldy #.loword(-4)
  sty speed_x
@down:
  bit #$0400
  beq @up
  ldy #3
  sty speed_y
@up:
  bit #$0800
  beq @done
  ldy #.loword(-3)
  sty speed_y
@done:
  sep #$20
  rts

; Near stars move twice as far as those behind them.
move:
  rep #$20
  inc frame
  lda stars_x
  clc
  adc speed_x
  sta stars_x
  lda stars_y
  clc
  adc speed_y
  sta stars_y
  sep #$20
  twice BG2HOFS, stars_x
  twice BG2VOFS, stars_y
  rep #$20
  lda stars_x
  lsr
  clc
  adc #100
  sta digits
  sep #$20
  twice BG3HOFS, digits
  rep #$20
  lda stars_y
  lsr
  clc
  adc #77
  sta digits
  sep #$20
  twice BG3VOFS, digits
  rts

; 64 colours that follow each other in a circle, one step every fourth picture.
colour_sky:
  rep #$30
  lda frame
  lsr
  and #$7E
  tay
  ldx #0
@strip:
  lda sky_colours,y
  sta sky + 3,x
  iny
  iny
  tya
  and #$7E
  tay
  txa
  clc
  adc #5
  tax
  cpx #SKY_STRIPS * 5
  bne @strip
  sep #$20
  rts

wave_title:
  rep #$30
  lda frame
  asl
  and #$7E
  tay
  ldx #0
@line:
  lda sine,y
  sta wave + 4,x
  iny
  iny
  tya
  and #$7E
  tay
  inx
  inx
  inx
  cpx #WAVES * 3
  bne @line
  sep #$20
  rts

; A new picture has been shown.
nmi:
  pha
  lda f:RDNMI
  pla
  rti

ignore:
  rti

.rodata
text_tiles:
  .incbin "text.tiles"
text_tiles_end:
text_map:
  .incbin "text.map"
star_tiles:
  .incbin "stars.tiles"
star_tiles_end:
star_map:
  .incbin "stars.map"
sky_colours:
  .incbin "sky.colours"
layer_colours:
  .incbin "layers.colours"
sine:
  .incbin "sine.words"

.segment "HEADER"
  .incbin "name.text"     ; 21 characters
  .byte $20               ; no banks, slow memory
  .byte $02               ; memory with a battery
  .byte 5                 ; 32 KiB
  .byte 1                 ; 2 KiB
  .byte 1                 ; 60 pictures a second
  .byte 0, 0
  .word $FFFF, 0          ; checksum and its complement: checksum.py

.segment "VECTORS"
  .word 0, 0, ignore, ignore, ignore, nmi, 0, ignore
  .word 0, 0, ignore, 0, ignore, ignore, reset, ignore
