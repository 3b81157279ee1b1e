# Video formats: pixel formats, selection and sizing, aspect ratios, descriptions.
