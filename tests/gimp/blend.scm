; What tests/gimp/headless.sh has GIMP do at last: from what `orvela enhance` made of in-*.png, to want-*.png, what the
; plug-in should have made. GIMP itself converts between precisions, and blends where the selection is soft.

(define (open file) (car (gimp-file-load RUN-NONINTERACTIVE file file)))
(define (layer-of image) (car (gimp-image-get-active-layer image)))
(define (save image drawable file)
  (file-png-save2 RUN-NONINTERACTIVE image drawable file file 0 1 0 0 0 0 0 0 1))

(define (convert precision)
  (let* ((number (number->string precision)) (image (open (string-append "enhanced-" number ".png"))))
    (gimp-image-convert-precision image precision)
    (gimp-image-convert-precision image PRECISION-U16-GAMMA)
    (save image (layer-of image) (string-append "want-" number ".png"))))
(for-each convert '(100 200 350 550 600 750))

; The enhanced part as a layer above, its mask from the same selection.
(let* ((image (open "rgb8.png"))
       (above (car (gimp-file-load-layer RUN-NONINTERACTIVE image "enhanced-soft.png"))))
  (gimp-image-insert-layer image above 0 0)
  (gimp-context-set-feather TRUE)
  (gimp-context-set-feather-radius 12 12)
  (gimp-image-select-ellipse image CHANNEL-OP-REPLACE 30 25 90 60)
  (let ((area (gimp-drawable-mask-intersect (cadr (vector->list (cadr (gimp-image-get-layers image)))))))
    (gimp-layer-set-offsets above (cadr area) (caddr area)))
  (gimp-layer-add-mask above (car (gimp-layer-create-mask above ADD-MASK-SELECTION)))
  (save image (car (gimp-image-flatten image)) "want-soft.png"))
